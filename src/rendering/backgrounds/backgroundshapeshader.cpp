#include "backgroundshapeshader.h"
#include "rendering/backgrounds/backgroundshapematerial.h"
#include "rendering/common/screenpattern.h"
#include "rendering/common/shadersource.h"

#include <QMatrix4x4>
#include <QOpenGLContext>
#include <QOpenGLFunctions>
#include <QSGTexture>

namespace {

QVector4D premultiplied(const QColor &c)
{
    const float a = float(c.alphaF());
    return QVector4D(float(c.redF()) * a, float(c.greenF()) * a, float(c.blueF()) * a, a);
}

} // namespace

BackgroundShapeShader::BackgroundShapeShader(bool tailed)
    : m_vertex(readShaderSource("backgroundshape.vert"))
    , m_fragment((tailed ? QByteArray("#define TAILED\n") : QByteArray()) + readShaderSource("backgroundshape.frag"))
{
}

const char *const *BackgroundShapeShader::attributeNames() const
{
    static const char *const names[] = { "vertex", "local", "shape", "tailBase", "tailTipTx", nullptr };
    return names;
}

void BackgroundShapeShader::initialize()
{
    QOpenGLShaderProgram *p = program();
    m_matrix = p->uniformLocation("qt_Matrix");
    m_opacity = p->uniformLocation("qt_Opacity");
    m_patternMatrix = p->uniformLocation("patternMatrix");
    m_color = p->uniformLocation("color");
    m_borderColor = p->uniformLocation("borderColor");
    m_backdropRect = p->uniformLocation("backdropRect");
    m_backdropWeight = p->uniformLocation("backdropWeight");
    m_patternWeight = p->uniformLocation("patternWeight");
    p->setUniformValue("backdropTexture", 0);
    p->setUniformValue("patternTexture", 1);
}

void BackgroundShapeShader::updateState(const RenderState &state, QSGMaterial *newMaterial, QSGMaterial *)
{
    QOpenGLShaderProgram *p = program();
    auto material = static_cast<BackgroundShapeMaterial *>(newMaterial);
    if (state.isMatrixDirty())
        p->setUniformValue(m_matrix, state.combinedMatrix());
    if (state.isOpacityDirty())
        p->setUniformValue(m_opacity, state.opacity());
    p->setUniformValue(m_color, premultiplied(material->color));
    p->setUniformValue(m_borderColor, premultiplied(material->borderColor));

    QOpenGLFunctions *f = state.context()->functions();
    QSize patternSize(1, 1);
    f->glActiveTexture(GL_TEXTURE1);
    const bool patterned = material->patternOpacity > 0 && ScreenPattern::bind(material->pattern, &patternSize);
    p->setUniformValue(m_patternWeight, patterned ? material->patternOpacity : 0.0f);
    p->setUniformValue(m_patternMatrix, ScreenPattern::matrix(state, patternSize));

    QSGTexture *backdrop = material->backdrop ? material->backdrop->texture() : nullptr;
    f->glActiveTexture(GL_TEXTURE0);
    if (backdrop) {
        backdrop->bind();
        const QRectF r = backdrop->normalizedTextureSubRect();
        p->setUniformValue(m_backdropRect, QVector4D(float(r.x()), float(r.y()), float(r.width()), float(r.height())));
    }
    p->setUniformValue(m_backdropWeight, backdrop ? 1.0f : 0.0f);
}
