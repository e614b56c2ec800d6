#pragma once

#include <QQuickImageProvider>

// The "transientimage" provider: image://transientimage/<file URL or path> loads the
// file into a texture; see TransientImageTextureFactory for when its pixels are freed.
class TransientImageProvider : public QQuickImageProvider
{
public:
    TransientImageProvider();

    QQuickTextureFactory *requestTexture(const QString &id, QSize *size, const QSize &requestedSize) override;
};
