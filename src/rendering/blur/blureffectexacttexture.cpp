#include "blureffectexacttexture.h"
#include "rendering/blur/blureffecttexture.h"

#include <QOpenGLContext>
#include <QOpenGLFramebufferObject>
#include <QOpenGLFunctions>

BlurEffectExactTexture::BlurEffectExactTexture(const BlurEffectTexture *blur)
    : m_blur(blur)
{
    setFiltering(QSGTexture::Linear);
    setHorizontalWrapMode(QSGTexture::ClampToEdge);
    setVerticalWrapMode(QSGTexture::ClampToEdge);
    // The renderer draws nothing with a texture named 0: name it now (render thread).
    if (QOpenGLContext *context = QOpenGLContext::currentContext())
        context->functions()->glGenTextures(1, &m_texture);
}

BlurEffectExactTexture::~BlurEffectExactTexture()
{
    if (m_texture) {
        if (QOpenGLContext *context = QOpenGLContext::currentContext())
            context->functions()->glDeleteTextures(1, &m_texture);
    }
}

QSize BlurEffectExactTexture::textureSize() const
{
    return m_blur->textureSize();
}

void BlurEffectExactTexture::bind()
{
    QOpenGLContext *context = QOpenGLContext::currentContext();
    if (!context)
        return;
    QOpenGLFunctions *f = context->functions();
    if (!m_texture)
        f->glGenTextures(1, &m_texture);
    f->glBindTexture(GL_TEXTURE_2D, m_texture);

    QOpenGLFramebufferObject *source = m_blur->framebuffer();
    const QSize size = m_blur->textureSize();
    const bool fresh = m_copied != m_blur->renderCount();
    if (source && !size.isEmpty() && (fresh || size != m_allocated)) {
        if (size != m_allocated) {
            f->glTexImage2D(GL_TEXTURE_2D, 0, GL_RGBA, size.width(), size.height(), 0, GL_RGBA, GL_UNSIGNED_BYTE, nullptr);
            m_allocated = size;
        }
        GLint previous = 0;
        f->glGetIntegerv(GL_FRAMEBUFFER_BINDING, &previous);
        f->glBindFramebuffer(GL_FRAMEBUFFER, source->handle());
        f->glCopyTexSubImage2D(GL_TEXTURE_2D, 0, 0, 0, 0, 0, size.width(), size.height());
        f->glBindFramebuffer(GL_FRAMEBUFFER, GLuint(previous));
        m_copied = m_blur->renderCount();
    }
    updateBindOptions(true);
}
