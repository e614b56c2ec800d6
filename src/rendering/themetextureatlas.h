#pragma once

#include "themeiconresolver.h"
#include "themeimagerecord.h"

#include <QImage>
#include <QObject>
#include <QVector>
#include <private/qsgareaallocator_p.h>

#include <atomic>

class QSGTexture;
class ThemeAtlasTexture;
class ThemeTexture;

// One window's shared texture for small theme images. Images smaller than half its side
// are packed into it; larger ones, and any that no longer fit, get textures of their own.
// Everything here runs on the window's render thread, except themeChanged().
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

    // Uploads what is pending and binds the atlas texture; false without a texture.
    bool bind();
    // GUI thread: the theme's primary colour changed; re-tint on the next bind.
    void themeChanged() { m_themeChanged = true; }

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
    bool m_allocated = false;
    uint m_texture = 0;
};
