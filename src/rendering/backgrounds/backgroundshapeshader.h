#pragma once

#include <QByteArray>
#include <QSGMaterialShader>

// The program of BackgroundShapeMaterial.
class BackgroundShapeShader : public QSGMaterialShader
{
public:
    explicit BackgroundShapeShader(bool tailed);

    const char *const *attributeNames() const override;
    void updateState(const RenderState &state, QSGMaterial *newMaterial, QSGMaterial *oldMaterial) override;

protected:
    const char *vertexShader() const override { return m_vertex.constData(); }
    const char *fragmentShader() const override { return m_fragment.constData(); }
    void initialize() override;

private:
    QByteArray m_vertex;
    QByteArray m_fragment;
    int m_matrix = -1, m_opacity = -1, m_patternMatrix = -1, m_color = -1, m_borderColor = -1,
        m_backdropRect = -1, m_backdropWeight = -1, m_patternWeight = -1;
};
