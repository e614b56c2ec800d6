#pragma once

#include <QSGTexture>

class BlurEffectTexture;

// The blurred result alone, in a texture of exactly its size, for consumers that read a
// texture from corner to corner (a ShaderEffect, anything that tiles or mipmaps). Copied
// from the blur's offscreen texture on bind whenever the blur has rendered since.
class BlurEffectExactTexture : public QSGTexture
{
    Q_OBJECT

public:
    explicit BlurEffectExactTexture(const BlurEffectTexture *blur);
    ~BlurEffectExactTexture() override;

    int textureId() const override { return int(m_texture); }
    QSize textureSize() const override;
    bool hasAlphaChannel() const override { return true; }
    bool hasMipmaps() const override { return false; }
    void bind() override;

private:
    const BlurEffectTexture *m_blur;
    unsigned int m_texture = 0;
    QSize m_allocated;
    quint64 m_copied = 0; // the blur's render count the copy was made at
};
