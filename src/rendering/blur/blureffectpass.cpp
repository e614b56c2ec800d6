#include "blureffectpass.h"
#include "rendering/blur/blureffectcache.h"
#include "rendering/blur/blureffecttextureprovider.h"

#include <QSGDynamicTexture>

#include <utility>

BlurEffectPass::BlurEffectPass(BlurEffectCache *cache)
    : m_cache(cache)
{
}

BlurEffectPass::~BlurEffectPass()
{
    QObject::disconnect(m_sourceChanged);
}

void BlurEffectPass::setSource(QSGTextureProvider *source)
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

void BlurEffectPass::setParameters(const BlurParameters &parameters)
{
    if (!parameters.sameBlur(m_parameters))
        m_dirty = true;
    m_parameters = parameters;
}

void BlurEffectPass::setProvider(BlurEffectTextureProvider *provider)
{
    m_provider = provider;
    if (provider)
        provider->setTexture(m_result);
}

void BlurEffectPass::releaseTargets()
{
    m_blurred.reset();
    m_result = nullptr;
    m_dirty = true;
    if (m_provider)
        m_provider->setTexture(nullptr);
}

QSGTexture *BlurEffectPass::update()
{
    QSGTexture *source = m_source ? m_source->texture() : nullptr;
    if (auto dynamic = qobject_cast<QSGDynamicTexture *>(source)) {
        if (dynamic->updateTexture())
            m_dirty = true;
    }
    if (source != m_lastSource) {
        m_lastSource = source;
        m_dirty = true;
    }
    if (!source || !m_parameters.blur) {
        if (std::exchange(m_result, nullptr) && m_provider)
            m_provider->setTexture(nullptr);
    } else if (m_dirty) {
        if (!m_blurred)
            m_blurred.reset(new BlurEffectTexture);
        BlurEffectShaderProgram *program = m_cache ? m_cache->program(m_parameters.kernel) : nullptr;
        m_result = program && m_blurred->render(source, program, m_parameters) ? m_blurred.get() : nullptr;
        m_dirty = false;
        // Consumers of the provider learn of new pixels, not only of a new texture.
        if (m_provider)
            m_provider->setTexture(m_result);
    }
    return m_result;
}
