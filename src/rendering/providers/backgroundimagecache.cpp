#include "backgroundimagecache.h"
#include "platform/boundedimagereader.h"

#include <QStandardPaths>

BackgroundImageCache::BackgroundImageCache()
    : ToloThumbnailCache(defaultDirectory())
{
    m_background.setWhiteLevel(1.0);
}

QString BackgroundImageCache::defaultDirectory()
{
    return QStandardPaths::writableLocation(QStandardPaths::GenericCacheLocation)
            + QLatin1String("/org.quorvaneos/pelkan/backgrounds");
}

ToloThumbnailCache::ThumbnailData BackgroundImageCache::generateThumbnail(const QString &source, const QString &cachePath,
                                                                          const QSize &size, bool crop, bool unbounded)
{
    QSize target(size.width() > 0 ? qMax(4, size.width()) : 0, size.height() > 0 ? qMax(4, size.height()) : 0);

    const qreal scale = m_background.appScaleFactor();
    BoundedImageReader file(source);
    const BoundedImageReader::Status status = file.open();
    if (status == BoundedImageReader::NotRegularFile || status == BoundedImageReader::TooLarge)
        return {}; // reported by the reader
    const QSize largest = file.declaredSize() * scale;
    if (largest.isValid() && (target.width() > largest.width() || target.height() > largest.height()))
        target = target.scaled(largest, Qt::KeepAspectRatio);

    const QImage image = readImageThumbnail(source, target, crop, unbounded);
    if (image.isNull())
        return {};
    const QImage processed = m_background.apply(image);
    return { writeCacheFile(cachePath, processed, source), processed };
}
