#pragma once

#include "rendering/themeimages/themeimagerecord.h"

#include <QImage>
#include <QRect>
#include <QSGTexture>

class ThemeTextureAtlas;
class ThemeTexture;

// A theme image inside a window's atlas: its rectangle holds the image and a one-pixel
// border, and its normalized sub-rectangle covers the image alone.
class ThemeAtlasTexture : public QSGTexture
{
    Q_OBJECT

public:
    ThemeAtlasTexture(ThemeTextureAtlas *atlas, const ThemeImageRecord &record, const QRect &rect, const QImage &bordered);
    ~ThemeAtlasTexture() override;

    int textureId() const override;
    QSize textureSize() const override { return m_record.imageSize; }
    bool hasAlphaChannel() const override { return m_record.hasAlpha || m_record.tint != ThemeImageRecord::Copy; }
    bool hasMipmaps() const override { return false; }
    bool isAtlasTexture() const override { return true; }
    QRectF normalizedTextureSubRect() const override { return m_subRect; }
    QSGTexture *removedFromAtlas() const override;
    void bind() override;

    const ThemeImageRecord &record() const { return m_record; }
    QRect rect() const { return m_rect; }
    QImage takeImage() { return std::exchange(m_image, QImage()); }
    bool hasImage() const { return !m_image.isNull(); }
    void dropImage() { m_image = QImage(); }
    void setImage(const QImage &image) { m_image = image; }
    void detach() { m_atlas = nullptr; }

private:
    ThemeTextureAtlas *m_atlas;
    ThemeImageRecord m_record;
    QRect m_rect;
    QRectF m_subRect;
    QImage m_image;
    mutable ThemeTexture *m_standalone = nullptr;
};
