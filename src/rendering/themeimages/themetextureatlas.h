#pragma once

#include "core/themeiconresolver.h"
#include "rendering/themeimages/themeimagerecord.h"

#include <QImage>
#include <QObject>
#include <QOpenGLContext>
#include <QPointer>
#include <QVector>
#include <private/qsgareaallocator_p.h>

#include <atomic>

class QSGTexture;
class ThemeAtlasTexture;
class ThemeTexture;

// The shared texture for small theme images of the windows that render with one GL
// context. Images smaller than half its side are packed into it; larger ones, and any
// that no longer fit, get textures of their own. Everything here runs on the render
// thread of that context, except themeChanged().
class ThemeTextureAtlas : public QObject
{
    Q_OBJECT

public:
    ThemeTextureAtlas(const Pelkan::ThemeIconResolver &resolver, int side);
    ~ThemeTextureAtlas() override;

    // 512, or the largest power of two not above the window's longer side minus one when
    // that is larger, capped at the GL limit.
    static int sideFor(const QSize &windowSize, int maximumTextureSize);

    int side() const { return m_side; }
    uint textureId() const { return m_texture; }

    QSGTexture *create(const ThemeImageRecord &record, const QString &path, const QImage &bordered);
    // A texture of its own, kept in step with the theme like those in the atlas.
    ThemeTexture *createStandalone(const ThemeImageRecord &record, const QImage &plain);

    // Uploads what is pending and binds the atlas texture; false without a texture.
    bool bind();
    // GUI thread: the theme's primary colour changed; re-tint on the next bind.
    void themeChanged() { m_themeChanged = true; }
    // Render thread, from any bind: after a colour change, every texture of the window
    // decodes again before it is next drawn, whichever of them is drawn first.
    bool takeThemeChange();

    QImage decodeAgain(const ThemeImageRecord &record, bool bordered) const;

    void forget(ThemeAtlasTexture *texture);
    void forget(ThemeTexture *texture);
    int pendingCount() const { return m_pending.size(); }
    int standaloneCount() const { return m_standalone.size(); }

private:
    const Pelkan::ThemeIconResolver m_resolver;
    int m_side;
    QSGAreaAllocator m_allocator;
    QVector<ThemeAtlasTexture *> m_pending;
    QVector<ThemeAtlasTexture *> m_uploaded;
    QVector<ThemeTexture *> m_standalone;
    std::atomic<bool> m_themeChanged { false };
    bool m_redecodePending = false; // pending textures hold images of the old colour
    bool m_allocated = false;
    uint m_texture = 0;
    QPointer<QOpenGLContext> m_context; // the texture's
};
