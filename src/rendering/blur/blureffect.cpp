#include "blureffect.h"
#include "rendering/blur/blureffectcache.h"
#include "rendering/blur/blureffectnode.h"
#include "rendering/blur/blureffecttextureprovider.h"
#include "rendering/blur/blurkernel.h"

#include <QQuickWindow>
#include <private/qquickwindow_p.h>

BlurEffect::BlurEffect(QQuickItem *parent)
    : QQuickItem(parent)
{
    setFlag(ItemHasContents);
}

BlurEffect::~BlurEffect()
{
    if (m_provider) {
        if (window())
            QQuickWindowQObjectCleanupJob::schedule(window(), m_provider);
        else
            delete m_provider;
    }
}

template <typename T, typename Signal>
void BlurEffect::assign(T &field, const T &value, Signal signal)
{
    if (field == value)
        return;
    field = value;
    Q_EMIT(this->*signal)();
    update();
}

void BlurEffect::setBlur(bool blur)
{
    m_blurExplicit = true;
    assign(m_blur, blur, &BlurEffect::blurChanged);
}

void BlurEffect::resetBlur()
{
    m_blurExplicit = false;
    assign(m_blur, isVisible(), &BlurEffect::blurChanged);
}

void BlurEffect::setSourceItem(QQuickItem *item)
{
    if (item == m_sourceItem)
        return;
    if (m_sourceItem)
        disconnect(m_sourceItem, &QObject::destroyed, this, &BlurEffect::sourceDestroyed);
    m_sourceItem = item;
    // A plain item is drawn into a texture of its own first.
    m_layer.hold(item);
    if (item)
        connect(item, &QObject::destroyed, this, &BlurEffect::sourceDestroyed);
    Q_EMIT sourceItemChanged();
    update();
}

void BlurEffect::sourceDestroyed()
{
    m_sourceItem = nullptr;
    Q_EMIT sourceItemChanged();
    update();
}

void BlurEffect::setKernel(int kernel)
{
    const Kernel clamped = Kernel(qBound(int(Gaussian5), kernel, int(Gaussian33)));
    if (clamped == m_kernel)
        return;
    m_kernel = clamped;
    Q_EMIT kernelChanged();
    if (!m_deviationExplicit)
        storeDeviation(BlurKernel::derivedDeviation(m_kernel));
    update();
}

void BlurEffect::setLevels(int levels)
{
    assign(m_levels, qBound(1, levels, 5), &BlurEffect::levelsChanged);
}

void BlurEffect::setIterations(int iterations)
{
    assign(m_iterations, qMax(1, iterations), &BlurEffect::iterationsChanged);
}

void BlurEffect::setIterationBehavior(IterationBehavior behavior)
{
    assign(m_iterationBehavior, behavior, &BlurEffect::iterationBehaviorChanged);
}

void BlurEffect::setDeviation(float deviation)
{
    m_deviationExplicit = true;
    storeDeviation(deviation);
}

void BlurEffect::resetDeviation()
{
    m_deviationExplicit = false;
    storeDeviation(BlurKernel::derivedDeviation(m_kernel));
}

void BlurEffect::storeDeviation(float deviation)
{
    assign(m_deviation, deviation, &BlurEffect::deviationChanged);
}

void BlurEffect::setIntensity(float intensity)
{
    assign(m_intensity, intensity, &BlurEffect::intensityChanged);
}

void BlurEffect::setOverlayColor(const QColor &color)
{
    assign(m_overlayColor, color, &BlurEffect::overlayColorChanged);
}

void BlurEffect::invalidateSceneGraph()
{
    m_invalidate = true;
    update();
}

void BlurEffect::itemChange(ItemChange change, const ItemChangeData &data)
{
    QQuickItem::itemChange(change, data);
    if (change == ItemVisibleHasChanged && !m_blurExplicit)
        assign(m_blur, data.boolValue, &BlurEffect::blurChanged);
}

QSGTextureProvider *BlurEffect::textureProvider() const
{
    if (!m_provider)
        m_provider = new BlurEffectTextureProvider;
    return m_provider;
}

void BlurEffect::releaseResources()
{
    if (m_provider && window()) {
        QQuickWindowQObjectCleanupJob::schedule(window(), m_provider);
        m_provider = nullptr;
    }
}

QSGNode *BlurEffect::updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *)
{
    QSGTextureProvider *source = m_sourceItem && m_sourceItem->isTextureProvider() ? m_sourceItem->textureProvider()
                                                                                   : nullptr;
    if (!source || width() <= 0 || height() <= 0) {
        delete oldNode;
        return nullptr;
    }
    auto node = static_cast<BlurEffectNode *>(oldNode);
    if (!node)
        node = new BlurEffectNode(BlurEffectCache::forWindow(window()));
    if (m_invalidate) {
        node->releaseTargets();
        m_invalidate = false;
    }
    BlurParameters parameters;
    parameters.blur = m_blur;
    parameters.kernel = m_kernel;
    parameters.levels = m_levels;
    parameters.iterations = m_iterations;
    parameters.iterateAllLevels = m_iterationBehavior == IterateAllLayers;
    parameters.deviation = m_deviation;
    parameters.intensity = m_intensity;
    parameters.overlayColor = m_overlayColor;
    node->setSource(source);
    node->setParameters(parameters);
    node->setRect(boundingRect());
    node->setProvider(static_cast<BlurEffectTextureProvider *>(textureProvider()));
    return node;
}
