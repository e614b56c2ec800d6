#pragma once

#include <QQuickImageProvider>

// The "pelkan-background" provider: image://pelkan-background/<file URL or path> gives
// the picture prepared as a background, from a cache on disk. Without a requested size
// the picture is as high as the screen; with both sides it fills them and is cut to
// them. Image loader threads each get their own cache, kept until the thread ends.
class BackgroundImageProvider : public QQuickImageProvider
{
public:
    BackgroundImageProvider();

    QImage requestImage(const QString &id, QSize *size, const QSize &requestedSize) override;

private:
    // Read on the GUI thread when made; loader threads only read these copies.
    int m_screenHeight;
    qreal m_appScaleFactor;
};
