#pragma once

#include "rendering/themeimages/themeimagerecord.h"

#include <QImage>

// Decodes theme images: "name" or "name?colour", resolved through the theme's icons.
namespace ThemeImageDecoder {

// Parses the id into a record (name and tint colour).
ThemeImageRecord parseId(const QString &id);

// Reads path, chooses the tint (the id's colour; else the theme's primary colour when the
// file says Grayscale=true; else none) and returns the bordered RGBA8888 image, filling in
// the record. A null image when reading failed; a warning unless the file was missing.
QImage decode(const QString &path, ThemeImageRecord &record, const QSize &requestedSize);

} // namespace ThemeImageDecoder
