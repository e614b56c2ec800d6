#include "themeimagedecoder.h"
#include "platform/boundedimagereader.h"
#include "core/pelkanlogging.h"
#include "core/theme.h"
#include "rendering/themeimages/themepixels.h"

#include <optional>


QColor ThemeImageRecord::effectiveColor() const
{
    switch (tint) {
    case Colour:
        return color;
    case ThemePrimary:
        return Pelkan::Theme::instance()->primaryColor();
    default:
        return QColor();
    }
}

namespace ThemeImageDecoder {

ThemeImageRecord parseId(const QString &id)
{
    ThemeImageRecord record;
    const int mark = id.indexOf(QLatin1Char('?'));
    record.name = mark < 0 ? id : id.left(mark);
    if (mark >= 0)
        record.color.setNamedColor(id.mid(mark + 1));
    return record;
}

namespace {

// The format a theme file's suffix names, for the suffixes the resolver looks for; empty
// for anything else.
QByteArray formatOfSuffix(const QString &path)
{
    if (path.endsWith(QLatin1String(".svg"), Qt::CaseInsensitive))
        return QByteArrayLiteral("svg");
    if (path.endsWith(QLatin1String(".png"), Qt::CaseInsensitive))
        return QByteArrayLiteral("png");
    if (path.endsWith(QLatin1String(".jpg"), Qt::CaseInsensitive))
        return QByteArrayLiteral("jpeg");
    return QByteArray();
}

} // namespace

QImage decode(const QString &path, ThemeImageRecord &record, const QSize &requestedSize)
{
    // Theme files are named after their format: told the format, the reader goes straight
    // to its plugin instead of asking every plugin whether it knows the data (a good part
    // of the cost of a small icon). A file whose name does not match its data is read again
    // with detection.
    std::optional<BoundedImageReader> named(std::in_place, path);
    const QByteArray format = formatOfSuffix(path);
    if (!format.isEmpty()) {
        named->reader().setFormat(format);
        named->reader().setAutoDetectImageFormat(false);
    }
    BoundedImageReader::Status status = named->open();
    if (status == BoundedImageReader::Unreadable && !format.isEmpty()) {
        named.emplace(path);
        status = named->open();
    }
    BoundedImageReader &file = *named;
    if (status == BoundedImageReader::Unreadable)
        qCWarning(lcPelkanCoreLog) << "Failed to load" << path << file.reader().errorString();
    if (status != BoundedImageReader::Ready)
        return QImage();
    QImageReader &reader = file.reader();
    if (record.color.isValid()) {
        record.tint = ThemeImageRecord::Colour;
    } else if (reader.text(QStringLiteral("Grayscale")) == QLatin1String("true")) {
        record.tint = ThemeImageRecord::ThemePrimary;
        record.themeTinted = true;
    } else {
        record.tint = ThemeImageRecord::Copy;
    }
    if (requestedSize.width() > 0 && requestedSize.height() > 0)
        reader.setScaledSize(BoundedImageReader::bounded(requestedSize));

    const QImage image = reader.read();
    if (image.isNull()) {
        qCWarning(lcPelkanCoreLog) << "Failed to load" << path << reader.errorString();
        return QImage();
    }
    record.imageSize = image.size();
    record.hasAlpha = image.hasAlphaChannel();
    return ThemePixels::render(image, record.effectiveColor(), true);
}

} // namespace ThemeImageDecoder
