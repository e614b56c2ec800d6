#include "backgroundimageprovider.h"
#include "rendering/providers/backgroundimagecache.h"
#include "core/screen.h"
#include "core/theme.h"

#include <QUrl>

BackgroundImageProvider::BackgroundImageProvider()
    : QQuickImageProvider(QQuickImageProvider::Image)
    , m_screenHeight(Pelkan::Screen::instance()->height())
    , m_appScaleFactor(Pelkan::Theme::instance()->pixelRatio())
{
}

QImage BackgroundImageProvider::requestImage(const QString &id, QSize *size, const QSize &requestedSize)
{
    // Per thread rather than per provider: Qt 5 reuses the slots of destroyed
    // QThreadStorage objects while other threads still hold values in them.
    static thread_local BackgroundImageCache cache;
    cache.setAppScaleFactor(m_appScaleFactor);

    const bool both = requestedSize.width() > 0 && requestedSize.height() > 0;
    const bool none = requestedSize.width() <= 0 && requestedSize.height() <= 0;
    const QUrl url(id);
    const ToloThumbnailCache::ThumbnailData thumbnail = cache.requestThumbnail(
            url.isLocalFile() ? url.toLocalFile() : id, none ? QSize(0, m_screenHeight) : requestedSize, both);
    if (size)
        *size = thumbnail.image.size();
    return thumbnail.image;
}
