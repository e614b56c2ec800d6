#pragma once

#include <QColor>
#include <QImage>

// The pixel work of theme images: tinting through a 256-entry table, and a one-pixel
// clamped border so that linear filtering inside a shared atlas never reads a neighbour.
namespace ThemePixels {

// An image in RGBA8888 premultiplied (bytes R, G, B, A). With a valid tint every pixel
// becomes the tint scaled by the source's alpha (or, for opaque formats, by its grey
// level); without one the pixels are copied. With `bordered` the result is two pixels
// larger in each direction and its outermost pixels repeat their inner neighbours.
QImage render(const QImage &source, const QColor &tint, bool bordered);

// The tinted image in ARGB32 premultiplied at the source's size, for painting with
// QPainter (whose byte order is B, G, R, A, hence the colour's red and blue swap places).
QImage renderArgb32(const QImage &source, const QColor &tint);

// The grey level used for opaque images: (11 R + 16 G + 5 B) / 32.
inline int grey(int r, int g, int b) { return (11 * r + 16 * g + 5 * b) >> 5; }

} // namespace ThemePixels
