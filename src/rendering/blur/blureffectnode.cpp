#include "blureffectnode.h"

BlurEffectNode::BlurEffectNode(BlurEffectCache *cache)
    : m_pass(cache)
    , m_geometry(QSGGeometry::defaultAttributes_TexturedPoint2D(), 4)
{
    setGeometry(&m_geometry);
    setMaterial(&m_material);
    setFlag(UsePreprocess);
}

void BlurEffectNode::setParameters(const BlurParameters &parameters)
{
    m_pass.setParameters(parameters);
    m_material.overlayColor = parameters.overlayColor;
    m_material.blurAlpha = parameters.intensity;
    markDirty(DirtyMaterial);
}

void BlurEffectNode::setRect(const QRectF &rect)
{
    QSGGeometry::updateTexturedRectGeometry(&m_geometry, rect, QRectF(0, 0, 1, 1));
    markDirty(DirtyGeometry);
}

void BlurEffectNode::releaseTargets()
{
    m_pass.releaseTargets();
    m_material.blur = nullptr;
}

void BlurEffectNode::preprocess()
{
    QSGTexture *const previousSource = m_material.source;
    QSGTexture *const previousBlur = m_material.blur;
    m_material.blur = m_pass.update();
    m_material.source = m_pass.source();
    // New pixels in the same textures need nothing: the shader binds them every frame.
    if (m_material.source != previousSource || m_material.blur != previousBlur)
        markDirty(DirtyMaterial);
}
