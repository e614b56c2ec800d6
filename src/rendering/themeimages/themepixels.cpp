#include "themepixels.h"

#include <cstring>

namespace ThemePixels {

namespace {

// The bytes R, G, B, A as one 32-bit word in memory order.
inline quint32 word(uint r, uint g, uint b, uint a)
{
#if Q_BYTE_ORDER == Q_LITTLE_ENDIAN
    return r | (g << 8) | (b << 16) | (a << 24);
#else
    return (r << 24) | (g << 16) | (b << 8) | a;
#endif
}

// Entry a is (R a / 255, G a / 255, B a / 255, a) as the bytes R, G, B, A, kept as one
// 32-bit word per entry so that a pixel is one load and one store. Loader threads tint
// mostly in the few colours of the theme: each keeps the table of its last colour.
struct TintTable {
    quint32 words[256];
    QRgb rgb = 0;
    bool made = false;

    // Not inlined: the caller keeps the table's address instead of asking for the
    // thread's storage on every pixel.
    Q_NEVER_INLINE static const quint32 *of(const QColor &color)
    {
        thread_local TintTable last;
        const QRgb rgb = color.rgb() & 0xffffff;
        if (!last.made || last.rgb != rgb) {
            last.fill(uint(qRed(rgb)), uint(qGreen(rgb)), uint(qBlue(rgb)));
            last.rgb = rgb;
            last.made = true;
        }
        return last.words;
    }

    void fill(uint r, uint g, uint b)
    {
        for (uint a = 0, ra = 0, ga = 0, ba = 0; a < 256; ++a, ra += r, ga += g, ba += b)
            words[a] = word(ra / 255, ga / 255, ba / 255, a);
    }
};

bool hasAlphaByte(QImage::Format format)
{
    return format == QImage::Format_ARGB32 || format == QImage::Format_ARGB32_Premultiplied
            || format == QImage::Format_RGBA8888 || format == QImage::Format_RGBA8888_Premultiplied;
}

bool isOpaqueRgb(QImage::Format format)
{
    return format == QImage::Format_RGB32 || format == QImage::Format_RGBX8888;
}

// One line of the source through the table: the index of each pixel is its alpha, or for
// opaque formats its grey level.
void tintLine(const uchar *source, QImage::Format format, int width, const quint32 *table, quint32 *out)
{
    switch (format) {
    case QImage::Format_ARGB32:
    case QImage::Format_ARGB32_Premultiplied: {
        // The common case, icons drawn with alpha, four pixels a round: much of an icon is
        // clear, and clear pixels stay clear in every tint (entry 0 is all zero).
        const QRgb *line = reinterpret_cast<const QRgb *>(source);
        int x = 0;
        for (; x + 4 <= width; x += 4) {
            quint64 pair[2];
            std::memcpy(pair, line + x, sizeof pair);
            if ((pair[0] | pair[1]) == 0) {
                std::memset(out + x, 0, 4 * sizeof(quint32));
                continue;
            }
            const quint32 a = table[line[x] >> 24], b = table[line[x + 1] >> 24];
            const quint32 c = table[line[x + 2] >> 24], d = table[line[x + 3] >> 24];
            out[x] = a;
            out[x + 1] = b;
            out[x + 2] = c;
            out[x + 3] = d;
        }
        for (; x < width; ++x)
            out[x] = table[line[x] >> 24];
        break;
    }
    case QImage::Format_RGBA8888:
    case QImage::Format_RGBA8888_Premultiplied:
        for (int x = 0; x < width; ++x)
            out[x] = table[source[4 * x + 3]];
        break;
    case QImage::Format_RGB32: {
        const QRgb *line = reinterpret_cast<const QRgb *>(source);
        for (int x = 0; x < width; ++x)
            out[x] = table[grey(qRed(line[x]), qGreen(line[x]), qBlue(line[x]))];
        break;
    }
    case QImage::Format_RGBX8888:
        for (int x = 0; x < width; ++x)
            out[x] = table[grey(source[4 * x], source[4 * x + 1], source[4 * x + 2])];
        break;
    default:
        Q_UNREACHABLE();
    }
}

// Writes the source into target at (offset, offset), tinted or copied.
void write(const QImage &source, const QColor &tint, QImage &target, int offset)
{
    const int width = source.width();
    uchar *bits = target.bits();
    const qsizetype stride = target.bytesPerLine();
    if (!tint.isValid()) {
        const QImage copy = source.convertToFormat(QImage::Format_RGBA8888_Premultiplied);
        for (int y = 0; y < copy.height(); ++y)
            std::memcpy(bits + (y + offset) * stride + 4 * offset, copy.constScanLine(y), size_t(4 * width));
        return;
    }
    QImage usable = source;
    if (!hasAlphaByte(source.format()) && !isOpaqueRgb(source.format()))
        usable = source.convertToFormat(source.hasAlphaChannel() ? QImage::Format_ARGB32 : QImage::Format_RGB32);
    const quint32 *table = TintTable::of(tint);
    const uchar *from = usable.constBits();
    const qsizetype fromStride = usable.bytesPerLine();
    const QImage::Format format = usable.format();
    const int height = usable.height();
    for (int y = 0; y < height; ++y)
        tintLine(from + y * fromStride, format, width, table, reinterpret_cast<quint32 *>(bits + (y + offset) * stride) + offset);
}

void clampBorder(QImage &image)
{
    const int w = image.width();
    const int h = image.height();
    uchar *bits = image.bits();
    const qsizetype stride = image.bytesPerLine();
    for (int y = 1; y < h - 1; ++y) {
        quint32 *line = reinterpret_cast<quint32 *>(bits + y * stride);
        line[0] = line[1];
        line[w - 1] = line[w - 2];
    }
    std::memcpy(bits, bits + stride, size_t(4 * w));
    std::memcpy(bits + (h - 1) * stride, bits + (h - 2) * stride, size_t(4 * w));
}

} // namespace

QImage render(const QImage &source, const QColor &tint, bool bordered)
{
    if (source.isNull())
        return QImage();
    const int border = bordered ? 1 : 0;
    QImage target(source.width() + 2 * border, source.height() + 2 * border, QImage::Format_RGBA8888_Premultiplied);
    write(source, tint, target, border);
    if (bordered)
        clampBorder(target);
    return target;
}

QImage renderArgb32(const QImage &source, const QColor &tint)
{
    if (source.isNull())
        return QImage();
    if (!tint.isValid())
        return source.convertToFormat(QImage::Format_ARGB32_Premultiplied);
    // The same byte table, with red and blue exchanged, writes B, G, R, A.
    const QColor swapped = QColor(tint.blue(), tint.green(), tint.red());
    QImage target(source.size(), QImage::Format_ARGB32_Premultiplied);
    write(source, swapped, target, 0);
    return target;
}

} // namespace ThemePixels
