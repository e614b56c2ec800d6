#include "overlaybackgroundsource.h"
#include "rendering/blur/blureffectcache.h"
#include "rendering/blur/blurkernel.h"
#include "rendering/overlay/overlaybackgroundsourcenode.h"

#include <QHash>
#include <QQuickWindow>
#include <QtMath>
#include <private/qquickshadereffectsource_p.h>
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
    m_sourceItem = item;
    if (item) {
        connect(item, &QObject::destroyed, this, [this] {
            m_sourceItem = nullptr;
            Q_EMIT sourceItemChanged();
            update();
        });
    }
    if (m_capture)
        m_capture->setSourceItem(item);
    updateCaptureRect();
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
    updateCaptureRect();
}

void OverlayBackgroundSource::removeUser(QQuickItem *user)
{
    m_users.remove(user);
    updateActive();
    updateCaptureRect();
}

void OverlayBackgroundSource::updateActive()
{
    const bool active = !m_users.isEmpty();
    if (active == m_active)
        return;
    m_active = active;
    // The capture costs a render of the source into a texture each time it changes:
    // only while someone shows it.
    disconnect(m_frames);
    if (active) {
        m_capture = new QQuickShaderEffectSource(this);
        m_capture->setSize(QSizeF(0, 0)); // renders its texture, draws nothing
        m_capture->setSourceItem(m_sourceItem);
        updateCaptureRect();
        if (window())
            m_frames = connect(window(), &QQuickWindow::afterAnimating, this, &OverlayBackgroundSource::updateCaptureRect);
    } else {
        delete std::exchange(m_capture, nullptr);
    }
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

// Before each frame: the part of the source behind the overlays, with room for the blur
// to reach beyond their edges.
void OverlayBackgroundSource::updateCaptureRect()
{
    QRectF rect;
    if (m_sourceItem && m_active) {
        for (QQuickItem *user : qAsConst(m_users))
            rect |= user->mapRectToItem(m_sourceItem, QRectF(0, 0, user->width(), user->height()));
        const qreal margin = 2 << m_levels;
        rect = rect.adjusted(-margin, -margin, margin, margin) & QRectF(0, 0, m_sourceItem->width(), m_sourceItem->height());
        rect = QRectF(QPointF(qFloor(rect.x()), qFloor(rect.y())), QPointF(qCeil(rect.right()), qCeil(rect.bottom())));
    }
    if (rect == m_captureRect)
        return;
    m_captureRect = rect;
    if (m_capture && !rect.isEmpty()) {
        m_capture->setSourceRect(rect);
        m_capture->setTextureSize(QSize(qCeil(rect.width() / 4), qCeil(rect.height() / 4)));
    }
    update();
    Q_EMIT captureRectChanged();
}

void OverlayBackgroundSource::itemChange(ItemChange change, const ItemChangeData &data)
{
    QQuickItem::itemChange(change, data);
    if (change == ItemSceneChange) {
        registerIn(data.window);
        disconnect(m_frames);
        if (m_active && data.window)
            m_frames = connect(data.window, &QQuickWindow::afterAnimating, this, &OverlayBackgroundSource::updateCaptureRect);
    }
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
    QSGTextureProvider *source = m_capture && m_sourceItem && !m_captureRect.isEmpty() ? m_capture->textureProvider() : nullptr;
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
    parameters.levels = qMax(1, m_levels - 2); // the capture is at a quarter of the size already
    parameters.deviation = BlurKernel::derivedDeviation(parameters.kernel);
    node->pass().setSource(source);
    node->pass().setParameters(parameters);
    node->pass().setProvider(static_cast<BlurEffectTextureProvider *>(textureProvider()));
    return node;
}
