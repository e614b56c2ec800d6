#include "blureffectshaderprogram.h"
#include "rendering/blur/blurkernel.h"
#include "core/pelkanlogging.h"
#include "rendering/common/shadersource.h"


namespace {

// weight0 ... weight(p + 1); the last is declared for the layout but never written.
QByteArray weightVaryings(int pairs)
{
    QByteArray text;
    for (int j = 0; j <= pairs + 1; ++j)
        text += "varying highp vec2 weight" + QByteArray::number(j) + ";\n";
    return text;
}

} // namespace

QByteArray BlurEffectShaderProgram::vertexSource(int pairs)
{
    QByteArray assignments;
    for (int j = 1; j <= pairs; ++j) {
        const QByteArray name = "weight" + QByteArray::number(j);
        const QByteArray first = QByteArray::number(2 * j - 1);
        const QByteArray second = QByteArray::number(2 * j);
        assignments += "    " + name + ".x = inputWeights[" + first + "] + inputWeights[" + second + "];\n";
        assignments += "    " + name + ".y = ((" + first + ".0 + vertexDirection.w) * inputWeights[" + first + "] + (" + second
                + ".0 + vertexDirection.w) * inputWeights[" + second + "]) * delta / " + name + ".x;\n";
    }
    return readShaderSource("blurpass.vert")
            .replace("WEIGHT_COUNT", QByteArray::number(2 * (pairs + 1) + 1))
            .replace("WEIGHT_VARYINGS", weightVaryings(pairs))
            .replace("WEIGHT_ASSIGNMENTS", assignments);
}

QByteArray BlurEffectShaderProgram::fragmentSource(int pairs)
{
    QByteArray fetches;
    for (int j = 1; j <= pairs; ++j) {
        const QByteArray name = "weight" + QByteArray::number(j);
        fetches += "        + (texture2D(source, vec2(max(tx.x - " + name + ".y, limits.x), tx.y))\n"
                   "           + texture2D(source, vec2(min(tx.x + " + name + ".y, limits.y), tx.y))) * " + name + ".x\n";
    }
    return readShaderSource("blurpass.frag").replace("WEIGHT_VARYINGS", weightVaryings(pairs)).replace("PAIR_FETCHES", fetches);
}

BlurEffectShaderProgram::BlurEffectShaderProgram(int kernel)
    : m_kernel(kernel)
{
    const int pairs = BlurKernel::pairs(kernel);
    if (!m_program.addShaderFromSourceCode(QOpenGLShader::Vertex, vertexSource(pairs))) {
        qCWarning(lcPelkanCoreLog) << "Error compiling blur effect vertex shader:" << m_program.log();
        return;
    }
    if (!m_program.addShaderFromSourceCode(QOpenGLShader::Fragment, fragmentSource(pairs))) {
        qCWarning(lcPelkanCoreLog) << "Error compiling blur effect fragment shader:" << m_program.log();
        return;
    }
    if (!m_program.link()) {
        qCWarning(lcPelkanCoreLog) << "Error linking blur effect shader program:" << m_program.log();
        return;
    }
    vertexPosition = m_program.attributeLocation("vertexPosition");
    vertexTx = m_program.attributeLocation("vertexTx");
    vertexDirection = m_program.attributeLocation("vertexDirection");
    vertexLimits = m_program.attributeLocation("vertexLimits");
    sourceTransform = m_program.uniformLocation("sourceTransform");
    source = m_program.uniformLocation("source");
    deltas = m_program.uniformLocation("deltas");
    weights = m_program.uniformLocation("inputWeights");
    if (vertexPosition < 0 || vertexTx < 0 || vertexDirection < 0 || vertexLimits < 0 || sourceTransform < 0
            || source < 0 || deltas < 0 || weights < 0) {
        qCWarning(lcPelkanCoreLog) << "Unresolved blur effect location ID."
                                   << "id_vertexPosition:" << vertexPosition << "id_vertexTx:" << vertexTx
                                   << "id_vertexDirection:" << vertexDirection << "id_vertexLimits:" << vertexLimits
                                   << "id_sourceTransform:" << sourceTransform << "id_source:" << source
                                   << "id_deltas:" << deltas << "id_weights:" << weights;
        return;
    }
    m_valid = true;
}
