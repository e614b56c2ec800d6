#pragma once

#include <QVariant>

typedef struct _GVariant GVariant;

namespace Pelkan {
namespace GVariantConversion {

// Converts a GVariant to the nearest QVariant: booleans, the integer and floating types,
// strings, string arrays, other arrays as lists and string-keyed dictionaries as maps.
// A null GVariant gives an invalid QVariant.
QVariant toQVariant(GVariant *value);

// Converts a QVariant to a new floating GVariant reference, or returns nullptr when the
// type has no configuration representation.
GVariant *fromQVariant(const QVariant &value);

} // namespace GVariantConversion
} // namespace Pelkan
