#pragma once

#include "rendering/blur/blureffectmaterial.h"
#include "rendering/blur/blureffectpass.h"
#include "rendering/blur/blurparameters.h"

#include <QSGGeometryNode>

class BlurEffectCache;
class BlurEffectTextureProvider;
class QSGTextureProvider;

// A blur effect in the scene graph. Before each frame (preprocess) it blurs its source
// again when the source or the blur changed, then draws the composite over its rectangle.
class BlurEffectNode : public QSGGeometryNode
{
public:
    explicit BlurEffectNode(BlurEffectCache *cache);

    void setSource(QSGTextureProvider *source) { m_pass.setSource(source); }
    void setParameters(const BlurParameters &parameters);
    void setRect(const QRectF &rect);
    void setProvider(BlurEffectTextureProvider *provider) { m_pass.setProvider(provider); }
    // Lets go of the offscreen textures; they are made again for the next blur.
    void releaseTargets();

    void preprocess() override;

private:
    BlurEffectPass m_pass;
    BlurEffectMaterial m_material;
    QSGGeometry m_geometry;
};
