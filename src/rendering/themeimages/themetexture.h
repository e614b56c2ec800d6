#pragma once

#include "rendering/themeimages/themeimagerecord.h"

#include <QImage>
#include <QSGTexture>

class ThemeTextureAtlas;

// A theme image with a texture of its own: too large for the atlas, or the atlas was full.
class ThemeTexture : public QSGTexture
{
    Q_OBJECT

public:
    ThemeTexture(ThemeTextureAtlas *atlas, const ThemeImageRecord &record, const QImage &image);
    ~ThemeTexture() override;

    int textureId() const override { return int(m_texture); }
    QSize textureSize() const override { return m_record.imageSize; }
    bool hasAlphaChannel() const override { return m_record.hasAlpha || m_record.tint != ThemeImageRecord::Copy; }
    bool hasMipmaps() const override { return mipmapFiltering() != QSGTexture::None; }
    void bind() override;

    void markDirty() { m_dirty = true; }
    void detach() { m_atlas = nullptr; }

private:
    ThemeTextureAtlas *m_atlas;
    ThemeImageRecord m_record;
    QImage m_image;
    uint m_texture = 0;
    bool m_dirty = true;
    bool m_themeTinted;
};
