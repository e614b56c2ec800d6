#pragma once

#include "rendering/blur/blurparameters.h"

#include <QRect>
#include <QSGTexture>

#include <memory>

class BlurEffectExactTexture;
class BlurEffectShaderProgram;
class QOpenGLBuffer;
class QOpenGLFramebufferObject;

// The blurred copy of a source texture, rendered on the render thread into a pair of
// offscreen textures. Each pass blurs along its input's x axis and writes its result
// transposed, so a pair of passes blurs both ways and ends the right way round. The
// first level is half the source's size and each further level half the one before,
// reusing the corner of the same textures.
class BlurEffectTexture : public QSGTexture
{
    Q_OBJECT

public:
    BlurEffectTexture();
    ~BlurEffectTexture() override;

    // Blurs source with program (for parameters' kernel); false when the offscreen
    // textures could not be made (reported).
    bool render(QSGTexture *source, BlurEffectShaderProgram *program, const BlurParameters &parameters);

    int textureId() const override;
    QSize textureSize() const override { return m_result.size(); }
    bool hasAlphaChannel() const override { return true; }
    bool hasMipmaps() const override { return false; }
    QRectF normalizedTextureSubRect() const override;
    void bind() override;
    // The result is a corner of a larger texture, as an atlas entry is: consumers that
    // cannot honour the sub-rectangle ask for a texture of its own.
    bool isAtlasTexture() const override { return true; }
    QSGTexture *removedFromAtlas() const override;

    QOpenGLFramebufferObject *framebuffer() const { return m_normal.get(); }
    quint64 renderCount() const { return m_renderCount; }

private:
    bool ensureTargets(const QSize &size);
    void drawPass(BlurEffectShaderProgram *program, const QRectF &input, QOpenGLFramebufferObject *target,
                  const QSize &output);

    std::unique_ptr<QOpenGLFramebufferObject> m_normal;     // the source's orientation
    std::unique_ptr<QOpenGLFramebufferObject> m_transposed; // width and height swapped
    std::unique_ptr<QOpenGLBuffer> m_vertices;
    QRect m_result; // the final level, in m_normal
    quint64 m_renderCount = 0;
    mutable std::unique_ptr<BlurEffectExactTexture> m_exact;
};
