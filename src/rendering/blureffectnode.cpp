#include "blureffectnode.h"
#include "blureffectcache.h"
#include "blureffecttextureprovider.h"

#include <QSGDynamicTexture>
#include <QSGTextureProvider>

BlurEffectNode::BlurEffectNode(BlurEffectCache *cache)
    : m_cache(cache)
    , m_geometry(QSGGeometry::defaultAttributes_TexturedPoint2D(), 4)
{
    setGeometry(&m_geometry);
    setMaterial(&m_material);
    setFlag(UsePreprocess);
}

BlurEffectNode::~BlurEffectNode()
{
    QObject::disconnect(m_sourceChanged);
}

void BlurEffectNode::setSource(QSGTextureProvider *source)
{
    if (source == m_source)
        return;
    QObject::disconnect(m_sourceChanged);
    m_source = source;
    m_dirty = true;
    // A layer announces new content here while the frame is being synchronised, before
    // any node is preprocessed.
    if (source) {
        m_sourceChanged = QObject::connect(source, &QSGTextureProvider::textureChanged, source, [this] { m_dirty = true; },
                                           Qt::DirectConnection);
    }
}

void BlurEffectNode::setParameters(const BlurParameters &parameters)
{
    if (!parameters.sameBlur(m_parameters))
        m_dirty = true;
    m_parameters = parameters;
    m_material.overlayColor = parameters.overlayColor;
    m_material.blurAlpha = parameters.intensity;
    markDirty(DirtyMaterial);
}

void BlurEffectNode::setRect(const QRectF &rect)
{
    QSGGeometry::updateTexturedRectGeometry(&m_geometry, rect, QRectF(0, 0, 1, 1));
    markDirty(DirtyGeometry);
}

void BlurEffectNode::setProvider(BlurEffectTextureProvider *provider)
{
    m_provider = provider;
}

void BlurEffectNode::releaseTargets()
{
    m_blurred.reset();
    m_material.blur = nullptr;
    m_dirty = true;
}

void BlurEffectNode::preprocess()
{
    QSGTexture *const previousSource = m_material.source;
    QSGTexture *const previousBlur = m_material.blur;
    QSGTexture *source = m_source ? m_source->texture() : nullptr;
    // A live source (a layer) renders on demand: make sure it is current before use.
    if (auto dynamic = qobject_cast<QSGDynamicTexture *>(source)) {
        if (dynamic->updateTexture())
            m_dirty = true;
    }
    if (source != m_lastSource) {
        m_lastSource = source;
        m_dirty = true;
    }
    m_material.source = source;

    if (!source || !m_parameters.blur) {
        m_material.blur = nullptr;
    } else if (m_dirty) {
        if (!m_blurred)
            m_blurred.reset(new BlurEffectTexture);
        BlurEffectShaderProgram *program = m_cache ? m_cache->program(m_parameters.kernel) : nullptr;
        m_material.blur = program && m_blurred->render(source, program, m_parameters) ? m_blurred.get() : nullptr;
        m_dirty = false;
        if (m_provider)
            m_provider->setTexture(m_material.blur);
    }
    // New pixels in the same textures need nothing: the shader binds them every frame.
    if (m_material.source != previousSource || m_material.blur != previousBlur)
        markDirty(DirtyMaterial);
}
