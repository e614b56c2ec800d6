#include "themetexture.h"
#include "rendering/themeimages/themetextureatlas.h"

#include <QOpenGLContext>
#include <QOpenGLFunctions>

ThemeTexture::ThemeTexture(ThemeTextureAtlas *atlas, const ThemeImageRecord &record, const QImage &image)
    : m_atlas(atlas)
    , m_record(record)
    , m_image(image)
    , m_themeTinted(record.themeTinted)
{
    // The renderer draws nothing with a texture whose id is 0: name it now (textures are
    // made on the render thread, with the context current); the pixels follow on bind.
    if (QOpenGLContext *context = QOpenGLContext::currentContext())
        context->functions()->glGenTextures(1, &m_texture);
}

ThemeTexture::~ThemeTexture()
{
    if (m_atlas)
        m_atlas->forget(this);
    if (m_texture) {
        if (QOpenGLContext *context = QOpenGLContext::currentContext())
            context->functions()->glDeleteTextures(1, &m_texture);
    }
}

void ThemeTexture::bind()
{
    QOpenGLContext *context = QOpenGLContext::currentContext();
    if (!context)
        return;
    QOpenGLFunctions *gl = context->functions();
    if (m_atlas)
        m_atlas->takeThemeChange();
    const bool upload = m_dirty;
    if (!m_texture)
        gl->glGenTextures(1, &m_texture);
    gl->glBindTexture(GL_TEXTURE_2D, m_texture);
    if (upload) {
        const QImage image = m_image.isNull() && m_atlas ? m_atlas->decodeAgain(m_record, false) : m_image;
        if (!image.isNull()) {
            gl->glTexImage2D(GL_TEXTURE_2D, 0, GL_RGBA, image.width(), image.height(), 0, GL_RGBA, GL_UNSIGNED_BYTE,
                             image.constBits());
            if (mipmapFiltering() != QSGTexture::None)
                gl->glGenerateMipmap(GL_TEXTURE_2D);
        }
        m_image = QImage();
        m_dirty = false;
    }
    updateBindOptions(upload);
}
