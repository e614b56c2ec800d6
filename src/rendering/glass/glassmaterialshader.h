#pragma once

#include <QByteArray>
#include <QSGMaterialShader>

// The shader program of one glass variant; the variants differ only in the coordinate the
// dash pattern is measured along.
class GlassMaterialShader : public QSGMaterialShader
{
public:
    explicit GlassMaterialShader(int angle);

    const char *const *attributeNames() const override;
    void updateState(const RenderState &state, QSGMaterial *newMaterial, QSGMaterial *oldMaterial) override;

protected:
    const char *vertexShader() const override { return m_vertex.constData(); }
    const char *fragmentShader() const override { return m_fragment.constData(); }
    void initialize() override;

private:
    QByteArray m_vertex;
    QByteArray m_fragment;
    int m_matrix = -1, m_patternMatrix = -1, m_opacity = -1, m_color = -1, m_backgroundColor = -1,
        m_centersize = -1, m_border = -1, m_sigma = -1, m_brightness = -1, m_size = -1, m_dash = -1, m_pattern = -1,
        m_patternWeight = -1;
};
