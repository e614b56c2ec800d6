#pragma once

#include "blureffectmaterial.h"
#include "blureffecttexture.h"
#include "blurparameters.h"

#include <QPointer>
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
    ~BlurEffectNode() override;

    void setSource(QSGTextureProvider *source);
    void setParameters(const BlurParameters &parameters);
    void setRect(const QRectF &rect);
    void setProvider(BlurEffectTextureProvider *provider);
    // Lets go of the offscreen textures; they are made again for the next blur.
    void releaseTargets();

    void preprocess() override;

private:
    BlurEffectCache *m_cache;
    QPointer<QSGTextureProvider> m_source;
    QMetaObject::Connection m_sourceChanged;
    QPointer<BlurEffectTextureProvider> m_provider;
    QSGTexture *m_lastSource = nullptr;
    BlurParameters m_parameters;
    bool m_dirty = true;
    std::unique_ptr<BlurEffectTexture> m_blurred;
    BlurEffectMaterial m_material;
    QSGGeometry m_geometry;
};
