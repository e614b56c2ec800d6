#include "overlaybackgroundsource.h"
#include "blureffectcache.h"
#include "blurkernel.h"
#include "overlaybackgroundsourcenode.h"

#include <QHash>
#include <QQuickWindow>
#include <private/qquickwindow_p.h>

namespace {

// The sources of each window, first made first (GUI thread).
QHash<QQuickWindow *, QList<OverlayBackgroundSource *>> &registry()
{
    static QHash<QQuickWindow *, QList<OverlayBackgroundSource *>> sources;
    return sources;
}

} // namespace

OverlayBackgroundSource::OverlayBackgroundSource(QQuickItem *parent)
    : QQuickItem(parent)
{
    setFlag(ItemHasContents);
}

OverlayBackgroundSource::~OverlayBackgroundSource()
{
    registerIn(nullptr);
    if (m_provider) {
        if (window())
            QQuickWindowQObjectCleanupJob::schedule(window(), m_provider);
        else
            delete m_provider;
    }
}

void OverlayBackgroundSource::setSourceItem(QQuickItem *item)
{
    if (item == m_sourceItem)
        return;
    if (m_sourceItem)
        disconnect(m_sourceItem, &QObject::destroyed, this, nullptr);
    m_layer.release();
    m_sourceItem = item;
    if (item) {
        connect(item, &QObject::destroyed, this, [this] {
            m_sourceItem = nullptr;
            Q_EMIT sourceItemChanged();
            update();
        });
    }
    if (m_active)
        m_layer.hold(item);
    Q_EMIT sourceItemChanged();
    update();
}

void OverlayBackgroundSource::setLevels(int levels)
{
    levels = qBound(1, levels, 5);
    if (levels == m_levels)
        return;
    m_levels = levels;
    Q_EMIT levelsChanged();
    update();
}

void OverlayBackgroundSource::addUser(QQuickItem *user)
{
    m_users.insert(user);
    updateActive();
}

void OverlayBackgroundSource::removeUser(QQuickItem *user)
{
    m_users.remove(user);
    updateActive();
}

void OverlayBackgroundSource::updateActive()
{
    const bool active = !m_users.isEmpty();
    if (active == m_active)
        return;
    m_active = active;
    // The capture costs a render of the source into a texture each time it changes:
    // only while someone shows it.
    if (active)
        m_layer.hold(m_sourceItem);
    else
        m_layer.release();
    Q_EMIT activeChanged();
    update();
}

OverlayBackgroundSource *OverlayBackgroundSource::forWindow(QQuickWindow *window)
{
    const QList<OverlayBackgroundSource *> sources = registry().value(window);
    return sources.isEmpty() ? nullptr : sources.first();
}

void OverlayBackgroundSource::registerIn(QQuickWindow *window)
{
    if (m_registeredIn == window)
        return;
    auto &sources = registry();
    if (m_registeredIn) {
        auto found = sources.find(m_registeredIn);
        if (found != sources.end()) {
            found->removeOne(this);
            if (found->isEmpty())
                sources.erase(found);
        }
    }
    m_registeredIn = window;
    if (window)
        sources[window].append(this);
}

void OverlayBackgroundSource::itemChange(ItemChange change, const ItemChangeData &data)
{
    QQuickItem::itemChange(change, data);
    if (change == ItemSceneChange)
        registerIn(data.window);
}

QSGTextureProvider *OverlayBackgroundSource::textureProvider() const
{
    if (!m_provider)
        m_provider = new BlurEffectTextureProvider;
    return m_provider;
}

void OverlayBackgroundSource::releaseResources()
{
    if (m_provider && window()) {
        QQuickWindowQObjectCleanupJob::schedule(window(), m_provider);
        m_provider = nullptr;
    }
}

QSGNode *OverlayBackgroundSource::updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *)
{
    QSGTextureProvider *source = m_active && m_sourceItem && m_sourceItem->isTextureProvider()
            ? m_sourceItem->textureProvider() : nullptr;
    if (!source) {
        delete oldNode;
        if (m_provider)
            m_provider->setTexture(nullptr);
        return nullptr;
    }
    auto node = static_cast<OverlayBackgroundSourceNode *>(oldNode);
    if (!node)
        node = new OverlayBackgroundSourceNode(BlurEffectCache::forWindow(window()));
    BlurParameters parameters;
    parameters.kernel = 1; // Gaussian9: soft enough at the lower levels
    parameters.levels = m_levels;
    parameters.deviation = BlurKernel::derivedDeviation(parameters.kernel);
    node->pass().setSource(source);
    node->pass().setParameters(parameters);
    node->pass().setProvider(static_cast<BlurEffectTextureProvider *>(textureProvider()));
    return node;
}
