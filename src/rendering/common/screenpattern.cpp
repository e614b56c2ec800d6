#include "screenpattern.h"

#include <QSGTexture>

bool ScreenPattern::bind(QSGTexture *pattern, QSize *size)
{
    // The pattern tiles across the screen: it needs a texture of its own.
    if (pattern && pattern->isAtlasTexture())
        pattern = pattern->removedFromAtlas();
    if (!pattern)
        return false;
    pattern->setHorizontalWrapMode(QSGTexture::Repeat);
    pattern->setVerticalWrapMode(QSGTexture::Repeat);
    pattern->bind();
    *size = pattern->textureSize().expandedTo(QSize(1, 1));
    return true;
}

QMatrix4x4 ScreenPattern::matrix(const QSGMaterialShader::RenderState &state, const QSize &patternSize)
{
    const QRect viewport = state.viewportRect();
    QMatrix4x4 m;
    m.scale(1.0f / qMax(1, patternSize.width()), -1.0f / qMax(1, patternSize.height()));
    m.scale(0.5f * viewport.width(), 0.5f * viewport.height());
    return m;
}
