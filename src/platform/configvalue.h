#pragma once

#include <QString>
#include <QVariant>

// Strict readings of configuration values. A key may hold any type a shell user writes
// (`dconf write KEY true` where a number belongs); these take a value only when its type
// is the one the key is for, and never narrow a number that does not fit.
namespace ConfigValue {

// Integers of any width that fit an int; not booleans, doubles or text.
bool toInt(const QVariant &value, int *result);
// Numbers, integral or not, that are finite; not booleans or text.
bool toReal(const QVariant &value, qreal *result);
// Text only.
bool toString(const QVariant &value, QString *result);

} // namespace ConfigValue
