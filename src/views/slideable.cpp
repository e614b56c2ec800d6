#include "slideable.h"

#include "gestures/declarativedragfilter.h"
#include "enums/declarativepagenavigation.h"
#include "enums/declarativetabviewaction.h"
#include "views/slide.h"
#include "views/slideablemodel.h"

#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlContext>
#include <QQmlEngine>
#include <QQmlInfo>
#include <QQuickWindow>
#include <QSet>
#include <QStyleHints>

#include <cmath>

namespace {

// A release faster than this (pixels per second along the view) goes on to the next item
// however short the drag was.
const qreal FlickVelocity = 400;

} // namespace

Slideable::Slideable(QQuickItem *parent)
    : QQuickItem(parent)
    , m_model(new SlideableModel(this))
{
    setFlag(ItemClipsChildrenToShape);
    setFiltersChildMouseEvents(true);
    setAcceptedMouseButtons(Qt::LeftButton);
    connect(m_model, &SlideableModel::changed, this, &Slideable::modelChangedRows);
    connect(m_model, &SlideableModel::rowChanged, this, &Slideable::updateRow);
    m_animation.setEasingCurve(QEasingCurve::OutQuad);
    connect(&m_animation, &QVariantAnimation::valueChanged, this, [this](const QVariant &value) {
        setPosition(value.toReal());
    });
    connect(&m_animation, &QVariantAnimation::finished, this, &Slideable::settled);
}

Slideable::~Slideable()
{
    m_animation.stop();
    // The delegates are the view's (the declared children are their creator's).
    if (m_delegate || m_children.isEmpty()) {
        const QList<QQuickItem *> items = m_items.values();
        m_items.clear();
        qDeleteAll(items);
    }
}

// Properties ---------------------------------------------------------------------------

QVariant Slideable::model() const
{
    return m_model->source();
}

void Slideable::setModel(const QVariant &model)
{
    m_model->setSource(model);
    Q_EMIT modelChanged();
}

void Slideable::setDelegate(QQmlComponent *delegate)
{
    if (delegate == m_delegate)
        return;
    m_delegate = delegate;
    modelChangedRows();
    Q_EMIT delegateChanged();
}

void Slideable::setOrientation(Qt::Orientation orientation)
{
    if (orientation == m_orientation)
        return;
    m_orientation = orientation;
    updateDragFilter();
    layoutItems();
    Q_EMIT orientationChanged();
}

void Slideable::setCurrentIndex(int index)
{
    if (index != m_currentIndex)
        moveTo(index, DeclarativeTabViewAction::Immediate);
}

void Slideable::keepRequestedIndex(int index)
{
    // Until the view is complete its model may not be set yet: the index is taken as asked
    // and fitted to the model once everything declared is in.
    if (index == m_currentIndex)
        return;
    m_currentIndex = index;
    Q_EMIT currentIndexChanged();
}

QQuickItem *Slideable::currentItem() const
{
    return m_items.value(m_currentIndex);
}

int Slideable::count() const
{
    return m_delegate || m_children.isEmpty() ? m_model->count() : m_children.size();
}

void Slideable::setCacheSize(int size)
{
    size = qMax(0, size);
    if (size == m_cacheSize)
        return;
    m_cacheSize = size;
    refresh();
    Q_EMIT cacheSizeChanged();
}

void Slideable::setLoops(bool loops)
{
    if (loops == m_loops)
        return;
    m_loops = loops;
    updateDragFilter();
    refresh();
    Q_EMIT loopsChanged();
}

void Slideable::setInteractive(bool interactive)
{
    if (interactive == m_interactive)
        return;
    m_interactive = interactive;
    Q_EMIT interactiveChanged();
}

void Slideable::setDuration(int duration)
{
    if (duration == m_duration)
        return;
    m_duration = qMax(0, duration);
    Q_EMIT durationChanged();
}

void Slideable::setPosition(qreal position)
{
    if (position == m_position)
        return;
    m_position = position;
    refresh();
    Q_EMIT positionChanged();
}

void Slideable::setMoving(bool moving)
{
    if (moving == m_moving)
        return;
    m_moving = moving;
    Q_EMIT movingChanged();
}

void Slideable::setDragging(bool dragging)
{
    if (dragging == m_dragging)
        return;
    m_dragging = dragging;
    Q_EMIT draggingChanged();
}

// Navigation --------------------------------------------------------------------------

void Slideable::moveTo(int index, int operationType)
{
    if (!m_complete) {
        keepRequestedIndex(index);
        return;
    }
    const int n = count();
    if (n == 0)
        return;
    index = m_loops ? wrap(index) : qBound(0, index, n - 1);
    if (operationType == DeclarativeTabViewAction::Immediate || !isVisible()) {
        m_animation.stop();
        land(index);
        return;
    }
    // The short way round when the ends are joined.
    animateTo(m_position + offsetOf(index));
}

void Slideable::next(int operationType)
{
    moveTo(m_currentIndex + 1, operationType);
}

void Slideable::previous(int operationType)
{
    moveTo(m_currentIndex - 1, operationType);
}

void Slideable::animateTo(qreal target)
{
    m_animation.stop();
    if (qAbs(target - m_position) < 1e-6) {
        settled();
        return;
    }
    setMoving(true);
    m_animation.setStartValue(m_position);
    m_animation.setEndValue(target);
    m_animation.setDuration(int(m_duration * qMin<qreal>(1, qAbs(target - m_position))) + 1);
    m_animation.start();
}

void Slideable::settled()
{
    if (m_dragging)
        return;
    land(wrap(int(std::lround(m_position)))); // the same place once the ends are joined
}

void Slideable::land(int index)
{
    const bool changed = index != m_currentIndex;
    m_currentIndex = index;
    m_position = index;
    setMoving(false);
    refresh();
    Q_EMIT positionChanged();
    if (changed) {
        updateDragFilter();
        Q_EMIT currentIndexChanged();
        Q_EMIT currentItemChanged();
    }
}

// Items -------------------------------------------------------------------------------

qreal Slideable::extent() const
{
    return m_orientation == Qt::Horizontal ? width() : height();
}

qreal Slideable::along(const QPointF &point) const
{
    return m_orientation == Qt::Horizontal ? point.x() : point.y();
}

int Slideable::wrap(int index) const
{
    const int n = count();
    if (n == 0)
        return 0;
    return m_loops ? ((index % n) + n) % n : qBound(0, index, n - 1);
}

qreal Slideable::offsetOf(int index) const
{
    qreal offset = index - m_position;
    const int n = count();
    if (m_loops && n > 0) {
        offset = std::fmod(offset, qreal(n));
        if (offset > n / 2.0)
            offset -= n;
        else if (offset <= -n / 2.0)
            offset += n;
    }
    return offset;
}

void Slideable::componentComplete()
{
    QQuickItem::componentComplete();
    if (!m_delegate) {
        m_children = childItems();
        for (int i = 0; i < m_children.size(); ++i)
            m_items.insert(i, m_children.at(i));
        if (!m_children.isEmpty())
            Q_EMIT countChanged();
    }
    m_complete = true;
    const int requested = m_currentIndex;
    m_currentIndex = wrap(m_currentIndex);
    m_position = m_currentIndex;
    if (m_currentIndex != requested)
        Q_EMIT currentIndexChanged();
    updateDragFilter();
    refresh();
    Q_EMIT aliveCountChanged();
}

void Slideable::geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChanged(newGeometry, oldGeometry);
    layoutItems();
}

void Slideable::modelChangedRows()
{
    if (!m_complete) {
        // Nothing is made yet, and the index asked for waits for the whole declaration.
        Q_EMIT countChanged();
        return;
    }
    if (!m_delegate)
        return;
    // Rows came, went or moved: what was made for them may stand for other rows now.
    const QList<int> alive = m_items.keys();
    for (int index : alive)
        releaseItem(index);
    const int n = count();
    m_animation.stop();
    land(n == 0 ? 0 : qBound(0, m_currentIndex, n - 1));
    updateDragFilter(); // the ends may have moved
    Q_EMIT countChanged();
    Q_EMIT currentItemChanged(); // made again
}

void Slideable::updateRow(int row)
{
    QQmlContext *context = m_contexts.value(m_items.value(row));
    if (!context)
        return;
    const QVariantHash values = m_model->values(row);
    for (auto value = values.cbegin(); value != values.cend(); ++value)
        context->setContextProperty(value.key(), value.value());
}

QQuickItem *Slideable::create(int index)
{
    QQmlContext *parentContext = m_delegate->creationContext() ? m_delegate->creationContext() : qmlContext(this);
    auto *context = new QQmlContext(parentContext);
    const QVariantHash values = m_model->values(index);
    for (auto value = values.cbegin(); value != values.cend(); ++value)
        context->setContextProperty(value.key(), value.value());
    QObject *object = m_delegate->beginCreate(context);
    auto *item = qobject_cast<QQuickItem *>(object);
    if (!item) {
        qmlWarning(this) << "the delegate must be an Item";
        if (object)
            m_delegate->completeCreate();
        delete object;
        delete context;
        return nullptr;
    }
    context->setParent(item);
    m_contexts.insert(item, context);
    item->setParentItem(this);
    m_items.insert(index, item);
    m_delegate->completeCreate();
    return item;
}

void Slideable::releaseItem(int index)
{
    QQuickItem *item = m_items.take(index);
    if (!item)
        return;
    m_contexts.remove(item);
    item->setVisible(false);
    item->setParentItem(nullptr);
    // At once, so that no more than the cache is ever alive; later only if a finger is
    // still on it (the event being delivered refers to it).
    if (window() && window()->mouseGrabberItem() && item->isAncestorOf(window()->mouseGrabberItem()))
        item->deleteLater();
    else
        delete item;
}

void Slideable::refresh()
{
    if (!m_complete)
        return;
    const int n = count();
    const int before = m_items.size();
    if (m_delegate) {
        QSet<int> wanted;
        if (n > 0) {
            const auto want = [&](int index) {
                if (m_loops || (index >= 0 && index < n))
                    wanted.insert(wrap(index));
            };
            want(m_currentIndex);
            const int backward = m_cacheSize / 2;
            const int forward = m_cacheSize - backward;
            for (int k = 1; k <= forward; ++k)
                want(m_currentIndex + k);
            for (int k = 1; k <= backward; ++k)
                want(m_currentIndex - k);
            // What a slide shows on its way.
            want(int(std::floor(m_position)));
            want(int(std::ceil(m_position)));
        }
        const QList<int> alive = m_items.keys();
        for (int index : alive) {
            if (wanted.contains(index))
                continue;
            auto *slide = qobject_cast<Slide *>(qmlAttachedPropertiesObject<Slide>(m_items.value(index), false));
            if (!slide || !slide->keepAlive() || index >= n)
                releaseItem(index);
        }
        for (int index : qAsConst(wanted)) {
            if (!m_items.contains(index))
                create(index);
        }
    }
    layoutItems();
    if (m_items.size() != before)
        Q_EMIT aliveCountChanged();
}

void Slideable::layoutItems()
{
    const qreal size = extent();
    for (auto entry = m_items.cbegin(); entry != m_items.cend(); ++entry) {
        QQuickItem *item = entry.value();
        const qreal offset = offsetOf(entry.key());
        const bool exposed = qAbs(offset) < 1;
        item->setSize(QSizeF(width(), height()));
        item->setPosition(m_orientation == Qt::Horizontal ? QPointF(offset * size, 0) : QPointF(0, offset * size));
        item->setVisible(exposed);
        auto *slide = qobject_cast<Slide *>(qmlAttachedPropertiesObject<Slide>(item, true));
        const int n = count();
        const bool hasForward = m_loops || entry.key() + 1 < n;
        const bool hasBackward = m_loops || entry.key() > 0;
        slide->update(this, entry.key(), offset, entry.key() == m_currentIndex, exposed, hasForward ? m_items.value(wrap(entry.key() + 1)) : nullptr,
                      hasBackward ? m_items.value(wrap(entry.key() - 1)) : nullptr);
    }
}

void Slideable::updateDragFilter()
{
    auto *filter = qobject_cast<DeclarativeDragFilter *>(qmlAttachedPropertiesObject<DeclarativeDragFilter>(this, true));
    const int n = count();
    int released = 0;
    if (!m_loops && n > 0 && m_currentIndex == 0)
        released |= DeclarativePageNavigation::Back;
    if (!m_loops && n > 0 && m_currentIndex == n - 1)
        released |= DeclarativePageNavigation::Forward;
    filter->setOrientations(m_orientation);
    filter->setReleasedNavigation(released);
}

// Gesture -----------------------------------------------------------------------------

bool Slideable::press(const QPointF &scenePosition, ulong timestamp)
{
    if (!m_interactive || count() < 2)
        return false;
    m_pressed = true;
    m_pressPosition = scenePosition;
    m_lastAlong = along(scenePosition);
    m_lastTimestamp = timestamp;
    m_velocity = 0;
    if (m_animation.state() == QAbstractAnimation::Running)
        m_animation.stop(); // caught mid-slide: the finger carries on from here
    m_pressViewPosition = m_position;
    return false;
}

bool Slideable::move(const QPointF &scenePosition, ulong timestamp)
{
    if (!m_pressed)
        return false;
    const qreal delta = along(scenePosition) - along(m_pressPosition);
    if (!m_dragging) {
        const qreal across = m_orientation == Qt::Horizontal ? scenePosition.y() - m_pressPosition.y()
                                                             : scenePosition.x() - m_pressPosition.x();
        if (qAbs(delta) <= QGuiApplication::styleHints()->startDragDistance() || qAbs(delta) < qAbs(across))
            return false;
        // Past the first or last item the drag belongs to the page around, if anything.
        const int n = count();
        if (!m_loops && ((delta > 0 && m_position <= 0) || (delta < 0 && m_position >= n - 1))) {
            m_pressed = false;
            return false;
        }
        m_pressPosition = scenePosition;
        m_pressViewPosition = m_position;
        setDragging(true);
        setMoving(true);
        grabMouse();
        setKeepMouseGrab(true);
        return true;
    }
    qreal position = m_pressViewPosition - delta / qMax<qreal>(1, extent());
    if (!m_loops)
        position = qBound<qreal>(0, position, count() - 1);
    const qreal now = along(scenePosition);
    if (timestamp > m_lastTimestamp) {
        const qreal velocity = (now - m_lastAlong) * 1000.0 / qreal(timestamp - m_lastTimestamp);
        m_velocity = 0.3 * m_velocity + 0.7 * velocity;
        m_lastTimestamp = timestamp;
        m_lastAlong = now;
    }
    setPosition(position);
    return true;
}

bool Slideable::release(const QPointF &scenePosition, ulong timestamp)
{
    Q_UNUSED(timestamp)
    Q_UNUSED(scenePosition)
    const bool wasDragging = m_dragging;
    m_pressed = false;
    if (!wasDragging) {
        if (m_moving && m_animation.state() != QAbstractAnimation::Running)
            animateTo(std::round(m_position));
        return false;
    }
    setDragging(false);
    setKeepMouseGrab(false);
    if (window() && window()->mouseGrabberItem() == this)
        ungrabMouse();
    // A quick flick goes on one item the way it went; a slow release settles on the nearer.
    qreal target = std::round(m_position);
    if (m_velocity < -FlickVelocity)
        target = std::floor(m_pressViewPosition + 1e-6) + 1;
    else if (m_velocity > FlickVelocity)
        target = std::ceil(m_pressViewPosition - 1e-6) - 1;
    if (!m_loops)
        target = qBound<qreal>(0, target, count() - 1);
    animateTo(target);
    return true;
}

bool Slideable::childMouseEventFilter(QQuickItem *, QEvent *event)
{
    if (!isVisible() || !isEnabled())
        return false;
    switch (event->type()) {
    case QEvent::MouseButtonPress: {
        auto *mouse = static_cast<QMouseEvent *>(event);
        return press(mouse->windowPos(), mouse->timestamp());
    }
    case QEvent::MouseMove: {
        auto *mouse = static_cast<QMouseEvent *>(event);
        return move(mouse->windowPos(), mouse->timestamp());
    }
    case QEvent::MouseButtonRelease: {
        auto *mouse = static_cast<QMouseEvent *>(event);
        return release(mouse->windowPos(), mouse->timestamp());
    }
    default:
        return false;
    }
}

void Slideable::mousePressEvent(QMouseEvent *event)
{
    press(event->windowPos(), event->timestamp());
    event->setAccepted(m_pressed);
}

void Slideable::mouseMoveEvent(QMouseEvent *event)
{
    move(event->windowPos(), event->timestamp());
}

void Slideable::mouseReleaseEvent(QMouseEvent *event)
{
    release(event->windowPos(), event->timestamp());
}

void Slideable::mouseUngrabEvent()
{
    // Taken away (a cancelled touch, a grab elsewhere): settle where it is nearest.
    m_pressed = false;
    if (m_dragging) {
        setDragging(false);
        setKeepMouseGrab(false);
        animateTo(std::round(m_position));
    }
}
