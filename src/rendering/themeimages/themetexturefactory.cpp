#include "themetexturefactory.h"
#include "rendering/themeimages/declarativeimageprovider.h"
#include "rendering/themeimages/themeimagedecoder.h"
#include "rendering/themeimages/themetextureatlas.h"

ThemeTextureFactory::ThemeTextureFactory(const Pelkan::ThemeIconResolver &resolver, const ThemeImageRecord &record,
                                         const QString &path, const QImage &bordered, quint32 generation)
    : m_resolver(resolver)
    , m_record(record)
    , m_path(path)
    , m_image(bordered)
    , m_generation(generation)
{
}

QSize ThemeTextureFactory::textureSize() const
{
    return m_record.imageSize + QSize(2, 2);
}

QSGTexture *ThemeTextureFactory::createTexture(QQuickWindow *window) const
{
    ThemeTextureAtlas *atlas = DeclarativeImageProvider::atlasFor(window, m_resolver);
    if (!atlas)
        return nullptr;
    if (!m_image.isNull() && m_generation != DeclarativeImageProvider::colorGeneration()) {
        // Made for an older theme colour: tinted ones, and files that moved, are redone.
        if (m_record.themeTinted || m_resolver.resolvePath(m_record.name) != m_path)
            m_image = QImage();
    }
    QSGTexture *texture = atlas->create(m_record, m_path, m_image);
    m_path.clear();
    m_image = QImage();
    return texture;
}

QImage ThemeTextureFactory::image() const
{
    if (m_image.isNull()) {
        ThemeImageRecord record = m_record;
        const QImage decoded = ThemeImageDecoder::decode(m_resolver.resolvePath(m_record.name), record,
                                                         m_record.imageSize);
        return decoded.isNull() ? QImage() : decoded.copy(1, 1, decoded.width() - 2, decoded.height() - 2);
    }
    return m_image.copy(1, 1, m_image.width() - 2, m_image.height() - 2);
}
