#include "glassmaterialshader.h"
#include "rendering/glass/glassmaterial.h"
#include "rendering/common/screenpattern.h"
#include "rendering/common/shadersource.h"

#include <QMatrix4x4>
#include <QOpenGLContext>
#include <QOpenGLFunctions>
#include <QSGTexture>

namespace {

const char *dashCoordinate(int angle)
{
    switch (angle) {
    case 90:
        return "(gl_FragCoord.y + dash.z)";
    case 180:
        return "(gl_FragCoord.x + dash.z)";
    case 270:
        return "(gl_FragCoord.y - dash.z)";
    default:
        return "(gl_FragCoord.x - dash.z)";
    }
}

} // namespace

GlassMaterialShader::GlassMaterialShader(int angle)
    : m_vertex(readShaderSource("glass.vert"))
    , m_fragment(readShaderSource("glass.frag").replace("DASH_COORDINATE", dashCoordinate(angle)))
{
}

const char *const *GlassMaterialShader::attributeNames() const
{
    static const char *const names[] = { "vertex", "a_texCoord", nullptr };
    return names;
}

void GlassMaterialShader::initialize()
{
    QOpenGLShaderProgram *p = program();
    m_matrix = p->uniformLocation("qt_Matrix");
    m_patternMatrix = p->uniformLocation("patternMatrix");
    m_opacity = p->uniformLocation("qt_Opacity");
    m_color = p->uniformLocation("color");
    m_backgroundColor = p->uniformLocation("backgroundColor");
    m_centersize = p->uniformLocation("centersize");
    m_border = p->uniformLocation("border");
    m_sigma = p->uniformLocation("sigma");
    m_brightness = p->uniformLocation("brightness");
    m_size = p->uniformLocation("size");
    m_dash = p->uniformLocation("dash");
    m_pattern = p->uniformLocation("patternTexture");
    m_patternWeight = p->uniformLocation("patternWeight");
}

void GlassMaterialShader::updateState(const RenderState &state, QSGMaterial *newMaterial, QSGMaterial *)
{
    QOpenGLShaderProgram *p = program();
    const GlassState &glass = static_cast<GlassMaterial *>(newMaterial)->state();
    if (state.isMatrixDirty())
        p->setUniformValue(m_matrix, state.combinedMatrix());
    if (state.isOpacityDirty())
        p->setUniformValue(m_opacity, state.opacity());

    QSize patternSize(1, 1);
    state.context()->functions()->glActiveTexture(GL_TEXTURE0);
    const bool patterned = ScreenPattern::bind(glass.pattern, &patternSize);
    // Without a pattern (not loaded, or failed) the glass reads as with a clear one, not
    // whatever texture the previous draw left bound.
    p->setUniformValue(m_patternWeight, patterned ? 1.0f : 0.0f);
    p->setUniformValue(m_patternMatrix, ScreenPattern::matrix(state, patternSize));

    p->setUniformValue(m_color, glass.color);
    p->setUniformValue(m_backgroundColor, glass.backgroundColor);
    p->setUniformValue(m_centersize, glass.centersize);
    p->setUniformValue(m_border, glass.border);
    p->setUniformValue(m_sigma, glass.sigma);
    p->setUniformValue(m_brightness, glass.brightness);
    p->setUniformValue(m_size, glass.size);
    p->setUniformValue(m_dash, glass.dash);
    p->setUniformValue(m_pattern, 0);
}
