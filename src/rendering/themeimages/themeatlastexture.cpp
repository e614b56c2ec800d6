#include "themeatlastexture.h"
#include "rendering/themeimages/themetexture.h"
#include "rendering/themeimages/themetextureatlas.h"

#include <QOpenGLContext>
#include <QOpenGLFunctions>

ThemeAtlasTexture::ThemeAtlasTexture(ThemeTextureAtlas *atlas, const ThemeImageRecord &record, const QRect &rect,
                                     const QImage &bordered)
    : m_atlas(atlas)
    , m_record(record)
    , m_rect(rect)
    , m_image(bordered)
{
    const qreal side = atlas->side();
    m_subRect = QRectF((rect.left() + 1) / side, (rect.top() + 1) / side,
                       record.imageSize.width() / side, record.imageSize.height() / side);
}

ThemeAtlasTexture::~ThemeAtlasTexture()
{
    delete m_standalone;
    if (m_atlas)
        m_atlas->forget(this);
}

int ThemeAtlasTexture::textureId() const
{
    return m_atlas ? int(m_atlas->textureId()) : 0;
}

void ThemeAtlasTexture::bind()
{
    if (!m_atlas || !m_atlas->bind())
        return;
    QOpenGLFunctions *gl = QOpenGLContext::currentContext()->functions();
    const GLint filter = filtering() == QSGTexture::Nearest ? GL_NEAREST : GL_LINEAR;
    gl->glTexParameteri(GL_TEXTURE_2D, GL_TEXTURE_MIN_FILTER, filter);
    gl->glTexParameteri(GL_TEXTURE_2D, GL_TEXTURE_MAG_FILTER, filter);
}

QSGTexture *ThemeAtlasTexture::removedFromAtlas() const
{
    // A texture of its own for uses an atlas cannot serve (tiling, shader sources).
    if (!m_standalone && m_atlas)
        m_standalone = m_atlas->createStandalone(m_record, m_atlas->decodeAgain(m_record, false));
    return m_standalone;
}
