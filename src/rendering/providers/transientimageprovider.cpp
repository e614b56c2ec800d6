#include "transientimageprovider.h"
#include "rendering/providers/transientimagetexturefactory.h"

#include <QUrl>

TransientImageProvider::TransientImageProvider()
    : QQuickImageProvider(QQuickImageProvider::Texture)
{
}

QQuickTextureFactory *TransientImageProvider::requestTexture(const QString &id, QSize *size, const QSize &requestedSize)
{
    const QUrl url(id);
    auto factory = new TransientImageTextureFactory(url.isLocalFile() ? url.toLocalFile() : id, requestedSize);
    const QSize decoded = factory->textureSize();
    if (size)
        *size = decoded;
    // Nothing to show (reported by the factory): the image element ends in its error
    // state, where an application's fallback can take over.
    if (decoded.isEmpty()) {
        delete factory;
        return nullptr;
    }
    return factory;
}
