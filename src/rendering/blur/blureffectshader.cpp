#include "blureffectshader.h"
#include "rendering/blur/blureffectmaterial.h"

#include <QMatrix4x4>
#include <QOpenGLContext>
#include <QOpenGLFunctions>
#include <QSGTexture>

namespace {

// Maps the unit square onto a texture's rectangle.
QMatrix4x4 subRectTransform(const QSGTexture *texture)
{
    const QRectF r = texture ? texture->normalizedTextureSubRect() : QRectF(0, 0, 1, 1);
    return QMatrix4x4(float(r.width()), 0, 0, float(r.x()), 0, float(r.height()), 0, float(r.y()), 0, 0, 1, 0, 0, 0, 0, 1);
}

} // namespace

BlurEffectShader::BlurEffectShader()
{
    setShaderSourceFile(QOpenGLShader::Vertex, QStringLiteral(":/quorvane/pelkan/shaders/blureffect.vert"));
    setShaderSourceFile(QOpenGLShader::Fragment, QStringLiteral(":/quorvane/pelkan/shaders/blureffect.frag"));
}

const char *const *BlurEffectShader::attributeNames() const
{
    static const char *const names[] = { "vertexPosition", "vertexTx", nullptr };
    return names;
}

void BlurEffectShader::initialize()
{
    QOpenGLShaderProgram *p = program();
    m_positionTransform = p->uniformLocation("positionTransform");
    m_sourceTransform = p->uniformLocation("sourceTransform");
    m_blurTransform = p->uniformLocation("blurTransform");
    m_overlayColor = p->uniformLocation("overlayColor");
    m_blurAlpha = p->uniformLocation("blurAlpha");
    m_opacity = p->uniformLocation("opacity");
    p->setUniformValue("sourceTexture", 0);
    p->setUniformValue("blurTexture", 1);
}

void BlurEffectShader::updateState(const RenderState &state, QSGMaterial *newMaterial, QSGMaterial *)
{
    QOpenGLShaderProgram *p = program();
    auto material = static_cast<BlurEffectMaterial *>(newMaterial);
    if (state.isMatrixDirty())
        p->setUniformValue(m_positionTransform, state.combinedMatrix());
    if (state.isOpacityDirty())
        p->setUniformValue(m_opacity, state.opacity());

    QOpenGLFunctions *f = state.context()->functions();
    // Without a blurred copy the source is drawn as it is.
    QSGTexture *blur = material->blur ? material->blur : material->source;
    f->glActiveTexture(GL_TEXTURE1);
    if (blur)
        blur->bind();
    f->glActiveTexture(GL_TEXTURE0);
    if (material->source)
        material->source->bind();

    p->setUniformValue(m_sourceTransform, subRectTransform(material->source));
    p->setUniformValue(m_blurTransform, subRectTransform(blur));
    const QColor &c = material->overlayColor;
    p->setUniformValue(m_overlayColor, QVector4D(float(c.redF()), float(c.greenF()), float(c.blueF()), float(c.alphaF())));
    p->setUniformValue(m_blurAlpha, material->blur ? material->blurAlpha : 0.0f);
}
