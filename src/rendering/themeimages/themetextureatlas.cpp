#include "themetextureatlas.h"
#include "rendering/themeimages/themeatlastexture.h"
#include "core/themeiconresolver.h"
#include "rendering/themeimages/themeimagedecoder.h"
#include "rendering/themeimages/themetexture.h"

#include <QOpenGLContext>
#include <QOpenGLFunctions>

ThemeTextureAtlas::ThemeTextureAtlas(const Pelkan::ThemeIconResolver &resolver, int side)
    : m_resolver(resolver)
    , m_side(side)
    , m_allocator(QSize(side, side))
{
}

ThemeTextureAtlas::~ThemeTextureAtlas()
{
    for (ThemeAtlasTexture *texture : qAsConst(m_pending))
        texture->detach();
    for (ThemeAtlasTexture *texture : qAsConst(m_uploaded))
        texture->detach();
    for (ThemeTexture *texture : qAsConst(m_standalone))
        texture->detach();
    // Released with its context: the name goes only where it was made.
    if (m_texture && m_context && QOpenGLContext::currentContext() == m_context)
        m_context->functions()->glDeleteTextures(1, &m_texture);
}

int ThemeTextureAtlas::sideFor(const QSize &windowSize, int maximumTextureSize)
{
    const int longer = qMax(windowSize.width(), windowSize.height());
    int side = 512;
    if (longer - 1 > 0) {
        int power = 1;
        while (power * 2 <= longer - 1)
            power *= 2;
        if (power > 512)
            side = power;
    }
    return qMin(side, maximumTextureSize);
}

QSGTexture *ThemeTextureAtlas::create(const ThemeImageRecord &record, const QString &, const QImage &bordered)
{
    const QSize size = record.imageSize;
    if (size.width() < m_side / 2 && size.height() < m_side / 2) {
        const QRect rect = m_allocator.allocate(size + QSize(2, 2));
        if (rect.isValid()) {
            auto texture = new ThemeAtlasTexture(this, record, rect, bordered);
            m_pending.append(texture);
            return texture;
        }
    }
    const QImage plain = bordered.isNull() ? QImage() : bordered.copy(1, 1, bordered.width() - 2, bordered.height() - 2);
    return createStandalone(record, plain);
}

ThemeTexture *ThemeTextureAtlas::createStandalone(const ThemeImageRecord &record, const QImage &plain)
{
    auto texture = new ThemeTexture(this, record, plain);
    m_standalone.append(texture);
    return texture;
}

bool ThemeTextureAtlas::takeThemeChange()
{
    if (!m_themeChanged.exchange(false))
        return false;
    m_pending += m_uploaded;
    m_uploaded.clear();
    m_redecodePending = true;
    for (ThemeTexture *texture : qAsConst(m_standalone))
        texture->markDirty();
    return true;
}

QImage ThemeTextureAtlas::decodeAgain(const ThemeImageRecord &record, bool bordered) const
{
    ThemeImageRecord copy = record;
    const QImage image = ThemeImageDecoder::decode(m_resolver.resolvePath(record.name), copy, record.imageSize);
    if (bordered || image.isNull())
        return image;
    return image.copy(1, 1, image.width() - 2, image.height() - 2);
}

bool ThemeTextureAtlas::bind()
{
    QOpenGLContext *context = QOpenGLContext::currentContext();
    if (!context)
        return false;
    QOpenGLFunctions *gl = context->functions();
    if (!m_allocated) {
        while (gl->glGetError() != GL_NO_ERROR) {
        }
        gl->glGenTextures(1, &m_texture);
        gl->glBindTexture(GL_TEXTURE_2D, m_texture);
        gl->glTexParameteri(GL_TEXTURE_2D, GL_TEXTURE_MIN_FILTER, GL_LINEAR);
        gl->glTexParameteri(GL_TEXTURE_2D, GL_TEXTURE_MAG_FILTER, GL_LINEAR);
        gl->glTexParameteri(GL_TEXTURE_2D, GL_TEXTURE_WRAP_S, GL_CLAMP_TO_EDGE);
        gl->glTexParameteri(GL_TEXTURE_2D, GL_TEXTURE_WRAP_T, GL_CLAMP_TO_EDGE);
        gl->glTexImage2D(GL_TEXTURE_2D, 0, GL_RGBA, m_side, m_side, 0, GL_RGBA, GL_UNSIGNED_BYTE, nullptr);
        if (gl->glGetError() != GL_NO_ERROR) {
            gl->glDeleteTextures(1, &m_texture);
            m_texture = 0;
            return false;
        }
        m_allocated = true;
        m_context = context;
    } else {
        gl->glBindTexture(GL_TEXTURE_2D, m_texture);
    }

    takeThemeChange();
    const bool themeChanged = std::exchange(m_redecodePending, false);
    for (ThemeAtlasTexture *texture : qAsConst(m_pending)) {
        const QImage image = themeChanged || !texture->hasImage() ? decodeAgain(texture->record(), true) : texture->takeImage();
        if (!image.isNull()) {
            const QRect rect = texture->rect();
            gl->glTexSubImage2D(GL_TEXTURE_2D, 0, rect.x(), rect.y(), image.width(), image.height(), GL_RGBA,
                                GL_UNSIGNED_BYTE, image.constBits());
        }
        texture->dropImage();
        m_uploaded.append(texture);
    }
    m_pending.clear();
    return true;
}

void ThemeTextureAtlas::forget(ThemeAtlasTexture *texture)
{
    m_pending.removeAll(texture);
    m_uploaded.removeAll(texture);
    m_allocator.deallocate(texture->rect());
}

void ThemeTextureAtlas::forget(ThemeTexture *texture)
{
    m_standalone.removeAll(texture);
}
