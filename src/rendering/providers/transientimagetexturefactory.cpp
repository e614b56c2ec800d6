#include "transientimagetexturefactory.h"
#include "platform/boundedimagereader.h"
#include "core/pelkanlogging.h"

#include <QQuickWindow>

TransientImageTextureFactory::TransientImageTextureFactory(const QString &path, const QSize &requestedSize)
    : m_path(path)
    , m_requestedSize(requestedSize)
{
}

bool TransientImageTextureFactory::dropsDecodedImages()
{
    static const bool drop = qEnvironmentVariableIsSet("QSG_TRANSIENT_IMAGES");
    return drop;
}

void TransientImageTextureFactory::decode() const
{
    BoundedImageReader file(m_path);
    const BoundedImageReader::Status status = file.open();
    QImageReader &reader = file.reader();
    if (status == BoundedImageReader::Ready) {
        if (m_requestedSize.width() > 0 && m_requestedSize.height() > 0)
            reader.setScaledSize(BoundedImageReader::bounded(m_requestedSize));
        m_image = reader.read();
    }
    m_size = m_image.size();
    // An unreadable file is reported once, not again at every texture request; files
    // refused for their kind or size were reported by the reader.
    const bool refused = status == BoundedImageReader::NotRegularFile || status == BoundedImageReader::TooLarge;
    if (m_image.isNull() && !m_decoded && !refused)
        qCWarning(lcPelkanCoreLog).noquote() << "TransientImageProvider: cannot read" << m_path << ":"
                                   << (status == BoundedImageReader::Missing ? QStringLiteral("file not found") : reader.errorString());
    m_decoded = true;
}

QSize TransientImageTextureFactory::textureSize() const
{
    if (!m_decoded)
        decode();
    return m_size;
}

QSGTexture *TransientImageTextureFactory::createTexture(QQuickWindow *window) const
{
    if (m_image.isNull())
        decode();
    if (m_size.isEmpty())
        return nullptr;
    QSGTexture *texture = window->createTextureFromImage(m_image, QQuickWindow::TextureCanUseAtlas);
    if (dropsDecodedImages())
        m_image = QImage();
    return texture;
}
