#include "blureffecttexture.h"
#include "rendering/blur/blureffectexacttexture.h"
#include "rendering/blur/blureffectshaderprogram.h"
#include "rendering/blur/blurkernel.h"
#include "core/pelkanlogging.h"

#include <QElapsedTimer>
#include <QMatrix4x4>
#include <QOpenGLBuffer>
#include <QOpenGLContext>
#include <QOpenGLFramebufferObject>
#include <QOpenGLFunctions>

namespace {

// One quad covering the target, reading its input transposed: output (x, y) takes input
// (y, x). Per vertex: position, input coordinates, direction, limits (16 floats).
const float Quad[] = {
    -1, -1, 0, 1,   0, 0, 0, 1,   1, 0, 0, 0,   0, 1, 0, 0,
     1, -1, 0, 1,   0, 1, 0, 1,   1, 0, 0, 0,   0, 1, 0, 0,
    -1,  1, 0, 1,   1, 0, 0, 1,   1, 0, 0, 0,   0, 1, 0, 0,
     1,  1, 0, 1,   1, 1, 0, 1,   1, 0, 0, 0,   0, 1, 0, 0,
};
const int Stride = 16 * sizeof(float);

void drainErrors(QOpenGLFunctions *f, const char *report = nullptr)
{
    for (GLenum error = f->glGetError(); error != GL_NO_ERROR; error = f->glGetError()) {
        if (report)
            qCWarning(lcPelkanCoreLog) << report << Qt::hex << error;
    }
}

void useLinearClamped(QOpenGLFunctions *f, GLuint texture)
{
    f->glBindTexture(GL_TEXTURE_2D, texture);
    f->glTexParameteri(GL_TEXTURE_2D, GL_TEXTURE_MIN_FILTER, GL_LINEAR);
    f->glTexParameteri(GL_TEXTURE_2D, GL_TEXTURE_MAG_FILTER, GL_LINEAR);
    f->glTexParameteri(GL_TEXTURE_2D, GL_TEXTURE_WRAP_S, GL_CLAMP_TO_EDGE);
    f->glTexParameteri(GL_TEXTURE_2D, GL_TEXTURE_WRAP_T, GL_CLAMP_TO_EDGE);
}

} // namespace

BlurEffectTexture::BlurEffectTexture()
{
    setFiltering(QSGTexture::Linear);
    setHorizontalWrapMode(QSGTexture::ClampToEdge);
    setVerticalWrapMode(QSGTexture::ClampToEdge);
}

BlurEffectTexture::~BlurEffectTexture() = default;

int BlurEffectTexture::textureId() const
{
    return m_normal ? int(m_normal->texture()) : 0;
}

QRectF BlurEffectTexture::normalizedTextureSubRect() const
{
    if (!m_normal)
        return QRectF(0, 0, 1, 1);
    // Half a texel in from each side: filtering at the edges never reaches the texels
    // beyond the result, which still hold larger levels.
    const QSizeF full = m_normal->size();
    return QRectF(0.5 / full.width(), 0.5 / full.height(), (m_result.width() - 1) / full.width(),
                  (m_result.height() - 1) / full.height());
}

QSGTexture *BlurEffectTexture::removedFromAtlas() const
{
    if (!m_exact)
        m_exact.reset(new BlurEffectExactTexture(this));
    return m_exact.get();
}

void BlurEffectTexture::bind()
{
    QOpenGLContext::currentContext()->functions()->glBindTexture(GL_TEXTURE_2D, GLuint(textureId()));
    updateBindOptions(true);
}

bool BlurEffectTexture::ensureTargets(const QSize &size)
{
    if (m_normal && m_normal->size() == size)
        return true;
    m_normal.reset(new QOpenGLFramebufferObject(size));
    m_transposed.reset(new QOpenGLFramebufferObject(size.transposed()));
    if (!m_normal->isValid() || !m_transposed->isValid()) {
        qCWarning(lcPelkanCoreLog) << "Blur effect framebuffer allocation error:" << size;
        m_normal.reset();
        m_transposed.reset();
        return false;
    }
    QOpenGLFunctions *f = QOpenGLContext::currentContext()->functions();
    useLinearClamped(f, m_normal->texture());
    useLinearClamped(f, m_transposed->texture());
    return true;
}

void BlurEffectTexture::drawPass(BlurEffectShaderProgram *program, const QRectF &input, QOpenGLFramebufferObject *target,
                                 const QSize &output)
{
    QOpenGLFunctions *f = QOpenGLContext::currentContext()->functions();
    target->bind();
    f->glViewport(0, 0, output.width(), output.height());
    const QMatrix4x4 transform(float(input.width()), 0, 0, float(input.x()),
                               0, float(input.height()), 0, float(input.y()),
                               0, 0, 1, 0,
                               0, 0, 0, 1);
    QOpenGLShaderProgram &p = program->program();
    p.setUniformValue(program->sourceTransform, transform);
    // Taps are spaced by the output's pixels (the input's x runs along the output's y), so
    // a pass that also halves the size blurs as far as the passes after it.
    p.setUniformValue(program->deltas, QVector3D(float(input.width() / output.height()), float(input.height() / output.width()), 0));
    f->glDrawArrays(GL_TRIANGLE_STRIP, 0, 4);
    drainErrors(f, "Blur shader setup error:");
}

bool BlurEffectTexture::render(QSGTexture *source, BlurEffectShaderProgram *program, const BlurParameters &parameters)
{
    QOpenGLContext *context = QOpenGLContext::currentContext();
    QOpenGLFunctions *f = context->functions();
    QElapsedTimer timer;
    timer.start();
    drainErrors(f);
    GLint previous = 0;
    f->glGetIntegerv(GL_FRAMEBUFFER_BINDING, &previous);

    const QSize base = source->textureSize();
    // The first level is already half the source's size: its first pass reads the source
    // at full detail and downsamples as it blurs. A blur needs no more.
    const QSize first = BlurKernel::halved(base);
    if (base.isEmpty() || !ensureTargets(first))
        return false;

    QVector<float> weights = BlurKernel::weights(parameters.deviation, parameters.kernel);
    weights.resize(2 * (BlurKernel::pairs(parameters.kernel) + 1) + 1);
    if (!m_vertices) {
        m_vertices.reset(new QOpenGLBuffer(QOpenGLBuffer::VertexBuffer));
        m_vertices->create();
        m_vertices->bind();
        m_vertices->allocate(Quad, sizeof Quad);
    }

    QOpenGLShaderProgram &p = program->program();
    p.bind();
    m_vertices->bind();
    const int attributes[] = { program->vertexPosition, program->vertexTx, program->vertexDirection, program->vertexLimits };
    for (int i = 0; i < 4; ++i) {
        p.enableAttributeArray(attributes[i]);
        p.setAttributeBuffer(attributes[i], GL_FLOAT, i * 4 * int(sizeof(float)), 4, Stride);
    }
    p.setUniformValue(program->source, 0);
    p.setUniformValueArray(program->weights, weights.constData(), weights.size(), 1);
    f->glActiveTexture(GL_TEXTURE0);
    f->glDisable(GL_BLEND);
    f->glDisable(GL_DEPTH_TEST);
    f->glDisable(GL_SCISSOR_TEST);
    f->glDisable(GL_STENCIL_TEST);
    f->glColorMask(GL_TRUE, GL_TRUE, GL_TRUE, GL_TRUE);

    // The source may sit in an atlas: read only its rectangle.
    source->setFiltering(QSGTexture::Linear);
    const QRectF sourceRect = source->normalizedTextureSubRect();
    const QSize full = m_normal->size();
    const QSize fullTransposed = m_transposed->size();

    QSize size = first;
    QSize previousLevel = first;
    bool fromSource = true;
    for (int level = 0; level < parameters.levels; ++level) {
        const bool last = level == parameters.levels - 1;
        const int iterations = parameters.iterateAllLevels || last ? parameters.iterations : 1;
        for (int i = 0; i < iterations; ++i) {
            if (fromSource) {
                source->bind();
                drawPass(program, sourceRect, m_transposed.get(), size.transposed());
            } else {
                f->glBindTexture(GL_TEXTURE_2D, m_normal->texture());
                const QRectF input(0, 0, qreal(previousLevel.width()) / full.width(), qreal(previousLevel.height()) / full.height());
                drawPass(program, input, m_transposed.get(), size.transposed());
            }
            f->glBindTexture(GL_TEXTURE_2D, m_transposed->texture());
            const QRectF input(0, 0, qreal(size.height()) / fullTransposed.width(), qreal(size.width()) / fullTransposed.height());
            drawPass(program, input, m_normal.get(), size);
            fromSource = false;
            previousLevel = size;
        }
        if (!last)
            size = BlurKernel::halved(size);
    }
    m_result = QRect(QPoint(0, 0), previousLevel);
    ++m_renderCount;

    for (int attribute : attributes)
        p.disableAttributeArray(attribute);
    p.release();
    m_vertices->release();
    f->glBindFramebuffer(GL_FRAMEBUFFER, previous ? GLuint(previous) : context->defaultFramebufferObject());

    if (lcPelkanCoreLog().isInfoEnabled()) {
        qCInfo(lcPelkanCoreLog) << "Blur things completed" << parameters.iterations << "iterations per "
                                << parameters.levels << "levels in" << timer.elapsed();
    }
    return true;
}
