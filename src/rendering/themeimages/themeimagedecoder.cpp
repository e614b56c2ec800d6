#include "themeimagedecoder.h"
#include "platform/boundedimagereader.h"
#include "core/pelkanlogging.h"
#include "core/theme.h"
#include "rendering/themeimages/themepixels.h"


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

QImage decode(const QString &path, ThemeImageRecord &record, const QSize &requestedSize)
{
    BoundedImageReader file(path);
    const BoundedImageReader::Status status = file.open();
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
