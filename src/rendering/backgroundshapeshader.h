#pragma once

#include <QSGMaterialShader>

// The program of BackgroundShapeMaterial.
class BackgroundShapeShader : public QSGMaterialShader
{
public:
    BackgroundShapeShader();

    const char *const *attributeNames() const override;
    void updateState(const RenderState &state, QSGMaterial *newMaterial, QSGMaterial *oldMaterial) override;

protected:
    void initialize() override;

private:
    int m_matrix = -1, m_opacity = -1, m_patternMatrix = -1, m_color = -1, m_borderColor = -1,
        m_backdropRect = -1, m_backdropWeight = -1, m_patternWeight = -1;
};
