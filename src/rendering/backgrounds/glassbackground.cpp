#include "glassbackground.h"
#include "rendering/common/sharedbackdrop.h"
#include "core/pelkanlogging.h"
#include "core/theme.h"

#include <QQmlEngine>
#include <QQuickWindow>
#include <private/qquickitem_p.h>

GlassBackground::GlassBackground(QQuickItem *parent)
    : BackgroundShapeItem(parent)
{
}

GlassBackground::~GlassBackground()
{
    useSource(false);
}

QColor GlassBackground::themeColor() const
{
    return Pelkan::Theme::instance()->rgba(Pelkan::Theme::instance()->overlayBackgroundColor(), 0.6);
}

void GlassBackground::setBackdrop(QQuickItem *backdrop)
{
    if (backdrop == m_backdrop)
        return;
    useSource(false);
    if (m_backdrop)
        disconnect(m_backdrop, nullptr, this, nullptr);
    m_backdrop = backdrop;
    m_warnedInside = false;
    if (backdrop && !backdrop->isTextureProvider()) {
        qCWarning(lcPelkanCoreLog) << "GlassBackground: the backdrop" << backdrop << "offers no texture; drawn without it";
        m_backdrop = nullptr;
    }
    if (m_backdrop) {
        connect(m_backdrop, &QObject::destroyed, this, [this] { setBackdrop(nullptr); });
        // A source capturing only part of its item maps it anew when that part changes.
        if (m_backdrop->metaObject()->indexOfSignal("captureRectChanged()") >= 0)
            connect(m_backdrop, SIGNAL(captureRectChanged()), this, SLOT(update()));
    }
    useSource(isVisible());
    followBackdrop();
    Q_EMIT backdropChanged();
    update();
}

void GlassBackground::setPattern(const QUrl &pattern)
{
    if (pattern == m_patternUrl)
        return;
    m_patternUrl = pattern;
    Q_EMIT patternChanged();
    if (isComponentComplete())
        loadPattern();
}

void GlassBackground::setPatternOpacity(qreal opacity)
{
    opacity = qBound<qreal>(0, opacity, 1);
    if (qFuzzyCompare(opacity, m_patternOpacity))
        return;
    m_patternOpacity = opacity;
    Q_EMIT patternOpacityChanged();
    update();
}

void GlassBackground::componentComplete()
{
    BackgroundShapeItem::componentComplete();
    loadPattern();
}

void GlassBackground::loadPattern()
{
    QQmlEngine *engine = qmlEngine(this);
    if (!engine || m_patternUrl.isEmpty()) {
        m_pattern.clear();
        update();
        return;
    }
    m_pattern.load(engine, m_patternUrl, QQuickPixmap::Cache);
    if (m_pattern.isLoading())
        m_pattern.connectFinished(this, SLOT(patternLoaded()));
    update();
}

void GlassBackground::patternLoaded()
{
    update();
}

void GlassBackground::itemChange(ItemChange change, const ItemChangeData &data)
{
    BackgroundShapeItem::itemChange(change, data);
    if (change == ItemVisibleHasChanged)
        useSource(data.boolValue);
    else if (change == ItemSceneChange)
        followBackdrop();
}

// An overlay background source captures only while it is shown somewhere.
void GlassBackground::useSource(bool use)
{
    auto source = qobject_cast<SharedBackdrop *>(m_backdrop);
    if (m_usedSource && (!use || m_usedSource != m_backdrop)) {
        if (auto used = qobject_cast<SharedBackdrop *>(m_usedSource))
            used->removeUser(this);
        m_usedSource = nullptr;
    }
    if (use && source && !m_usedSource) {
        m_usedSource = m_backdrop;
        source->addUser(this);
    }
}

// Moving the panel, or anything above it, moves what lies behind it without touching
// this item: before each frame, see whether the corners moved in the backdrop.
void GlassBackground::followBackdrop()
{
    disconnect(m_frames);
    if (m_backdrop && window())
        m_frames = connect(window(), &QQuickWindow::afterAnimating, this, &GlassBackground::checkMoved);
}

void GlassBackground::checkMoved()
{
    if (isVisible() && backdropCorners() != m_lastCorners)
        update();
}

QQuickItem *GlassBackground::capturedItem() const
{
    if (!m_backdrop)
        return nullptr;
    auto source = m_backdrop->property("sourceItem").value<QQuickItem *>();
    return source ? source : m_backdrop.data();
}

QVector<QPointF> GlassBackground::backdropCorners() const
{
    QQuickItem *captured = capturedItem();
    if (!captured || captured->width() <= 0 || captured->height() <= 0)
        return {};
    if (captured->isAncestorOf(this)) {
        if (!std::exchange(m_warnedInside, true)) {
            qCWarning(lcPelkanCoreLog) << "GlassBackground:" << this << "lies inside" << captured
                                       << "which its backdrop shows; drawn without the backdrop";
        }
        return {};
    }
    // What the backdrop's texture shows: a part of the captured item, or all of it.
    QRectF shown = m_backdrop->property("captureRect").toRectF();
    if (shown.isEmpty())
        shown = QRectF(0, 0, captured->width(), captured->height());
    const QRectF r = boundingRect();
    QVector<QPointF> corners;
    for (const QPointF &p : { r.topLeft(), r.topRight(), r.bottomLeft(), r.bottomRight() }) {
        const QPointF in = mapToItem(captured, p) - shown.topLeft();
        corners.append(QPointF(in.x() / shown.width(), in.y() / shown.height()));
    }
    return corners;
}

BackgroundShape GlassBackground::shape() const
{
    BackgroundShape s = BackgroundShapeItem::shape();
    for (int i = 0; i < m_lastCorners.size(); ++i)
        s.backdrop[i] = m_lastCorners.at(i);
    return s;
}

void GlassBackground::updateMaterial(BackgroundShapeMaterial *material)
{
    // Called before shape(), which uses the corners found here.
    m_lastCorners = backdropCorners();
    material->backdrop = m_lastCorners.isEmpty() ? nullptr : m_backdrop->textureProvider();
    material->pattern = m_pattern.textureFactory()
            ? QQuickItemPrivate::get(this)->sceneGraphRenderContext()->textureForFactory(m_pattern.textureFactory(), window())
            : nullptr;
    material->patternOpacity = material->pattern ? float(m_patternOpacity) : 0.0f;
}
