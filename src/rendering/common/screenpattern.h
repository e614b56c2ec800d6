#pragma once

#include <QMatrix4x4>
#include <QSGMaterialShader>

class QSGTexture;

// A pattern that tiles across the screen, one texel per device pixel, anchored to it.
namespace ScreenPattern {

// Binds pattern (taken out of an atlas, set to repeat) to the active texture unit; false,
// binding nothing, without one.
bool bind(QSGTexture *pattern, QSize *size);

// The matrix from clip coordinates to the pattern's texture coordinates, y pointing down.
QMatrix4x4 matrix(const QSGMaterialShader::RenderState &state, const QSize &patternSize);

} // namespace ScreenPattern
