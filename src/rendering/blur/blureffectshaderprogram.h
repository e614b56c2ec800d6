#pragma once

#include <QOpenGLShaderProgram>

// The compiled program of one blur kernel: a pass with p merged tap pairs per side.
// Lives on the render thread, in its window's BlurEffectCache.
class BlurEffectShaderProgram
{
public:
    explicit BlurEffectShaderProgram(int kernel);

    // False when compiling or linking failed (and was reported); such a program is not
    // used for drawing.
    bool isValid() const { return m_valid; }
    int kernel() const { return m_kernel; }
    QOpenGLShaderProgram &program() { return m_program; }

    // Sources for p pairs, from the shader files.
    static QByteArray vertexSource(int pairs);
    static QByteArray fragmentSource(int pairs);

    int vertexPosition = -1;
    int vertexTx = -1;
    int vertexDirection = -1;
    int vertexLimits = -1;
    int sourceTransform = -1;
    int source = -1;
    int deltas = -1;
    int weights = -1;

private:
    QOpenGLShaderProgram m_program;
    int m_kernel;
    bool m_valid = false;
};
