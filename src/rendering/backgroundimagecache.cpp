#include "backgroundimagecache.h"

#include <QImageReader>
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
    QImageReader reader(source);
    reader.setAutoTransform(true);
    const QSize largest = reader.size() * scale;
    if (largest.isValid() && (target.width() > largest.width() || target.height() > largest.height()))
        target = target.scaled(largest, Qt::KeepAspectRatio);

    const QImage image = readImageThumbnail(source, target, crop, unbounded);
    if (image.isNull())
        return {};
    const QImage processed = m_background.apply(image);
    return { writeCacheFile(cachePath, processed), processed };
}
