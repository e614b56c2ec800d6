#pragma once

#include <QSGMaterialShader>

// The composite of a blur effect (shaders/blureffect.*).
class BlurEffectShader : public QSGMaterialShader
{
public:
    BlurEffectShader();

    const char *const *attributeNames() const override;
    void updateState(const RenderState &state, QSGMaterial *newMaterial, QSGMaterial *oldMaterial) override;

protected:
    void initialize() override;

private:
    int m_positionTransform = -1;
    int m_sourceTransform = -1;
    int m_blurTransform = -1;
    int m_overlayColor = -1;
    int m_blurAlpha = -1;
    int m_opacity = -1;
};
