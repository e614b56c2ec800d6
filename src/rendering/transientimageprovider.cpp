#include "transientimageprovider.h"
#include "transientimagetexturefactory.h"

#include <QUrl>

TransientImageProvider::TransientImageProvider()
    : QQuickImageProvider(QQuickImageProvider::Texture)
{
}

QQuickTextureFactory *TransientImageProvider::requestTexture(const QString &id, QSize *size, const QSize &requestedSize)
{
    const QUrl url(id);
    auto factory = new TransientImageTextureFactory(url.isLocalFile() ? url.toLocalFile() : id, requestedSize);
    if (size)
        *size = factory->textureSize();
    return factory;
}
