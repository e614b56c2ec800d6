#include "themepixels.h"

#include <cstring>

namespace ThemePixels {

namespace {

// Entry a is (R a / 255, G a / 255, B a / 255, a) as the bytes R, G, B, A.
struct TintTable {
    uchar bytes[256][4];
    explicit TintTable(const QColor &color)
    {
        const int r = color.red(), g = color.green(), b = color.blue();
        for (int a = 0; a < 256; ++a) {
            bytes[a][0] = uchar(r * a / 255);
            bytes[a][1] = uchar(g * a / 255);
            bytes[a][2] = uchar(b * a / 255);
            bytes[a][3] = uchar(a);
        }
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

// The table index of each source pixel of one line.
void indices(const QImage &source, int y, uchar *out)
{
    const int width = source.width();
    switch (source.format()) {
    case QImage::Format_ARGB32:
    case QImage::Format_ARGB32_Premultiplied: {
        const QRgb *line = reinterpret_cast<const QRgb *>(source.constScanLine(y));
        for (int x = 0; x < width; ++x)
            out[x] = uchar(qAlpha(line[x]));
        break;
    }
    case QImage::Format_RGBA8888:
    case QImage::Format_RGBA8888_Premultiplied: {
        const uchar *line = source.constScanLine(y);
        for (int x = 0; x < width; ++x)
            out[x] = line[4 * x + 3];
        break;
    }
    case QImage::Format_RGB32: {
        const QRgb *line = reinterpret_cast<const QRgb *>(source.constScanLine(y));
        for (int x = 0; x < width; ++x)
            out[x] = uchar(grey(qRed(line[x]), qGreen(line[x]), qBlue(line[x])));
        break;
    }
    case QImage::Format_RGBX8888: {
        const uchar *line = source.constScanLine(y);
        for (int x = 0; x < width; ++x)
            out[x] = uchar(grey(line[4 * x], line[4 * x + 1], line[4 * x + 2]));
        break;
    }
    default:
        Q_UNREACHABLE();
    }
}

// Writes the source into target at (offset, offset), tinted or copied.
void write(const QImage &source, const QColor &tint, QImage &target, int offset)
{
    const int width = source.width();
    if (!tint.isValid()) {
        const QImage copy = source.convertToFormat(QImage::Format_RGBA8888_Premultiplied);
        for (int y = 0; y < copy.height(); ++y)
            std::memcpy(target.scanLine(y + offset) + 4 * offset, copy.constScanLine(y), size_t(4 * width));
        return;
    }
    QImage usable = source;
    if (!hasAlphaByte(source.format()) && !isOpaqueRgb(source.format()))
        usable = source.convertToFormat(source.hasAlphaChannel() ? QImage::Format_ARGB32 : QImage::Format_RGB32);
    const TintTable table(tint);
    QVector<uchar> index(width);
    for (int y = 0; y < usable.height(); ++y) {
        indices(usable, y, index.data());
        uchar *line = target.scanLine(y + offset) + 4 * offset;
        for (int x = 0; x < width; ++x)
            std::memcpy(line + 4 * x, table.bytes[index[x]], 4);
    }
}

void clampBorder(QImage &image)
{
    const int w = image.width();
    const int h = image.height();
    for (int y = 1; y < h - 1; ++y) {
        quint32 *line = reinterpret_cast<quint32 *>(image.scanLine(y));
        line[0] = line[1];
        line[w - 1] = line[w - 2];
    }
    std::memcpy(image.scanLine(0), image.constScanLine(1), size_t(4 * w));
    std::memcpy(image.scanLine(h - 1), image.constScanLine(h - 2), size_t(4 * w));
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
