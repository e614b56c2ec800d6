#include "autoscrollcontroller.h"

#include <QGuiApplication>
#include <QInputMethod>
#include <QPropertyAnimation>
#include <QQuickWindow>

#include <algorithm>

AutoScrollController::AutoScrollController(QObject *parent)
    : QObject(parent)
    , m_animation(new QPropertyAnimation(this))
{
    m_animation->setDuration(200);
    m_animation->setEasingCurve(QEasingCurve::OutQuad);
    // Once per turn of the event loop: a focus change, the cursor moving and a relayout
    // often arrive together.
    m_pending.setSingleShot(true);
    m_pending.setInterval(0);
    connect(&m_pending, &QTimer::timeout, this, &AutoScrollController::ensureVisible);

    QInputMethod *inputMethod = QGuiApplication::inputMethod();
    connect(inputMethod, &QInputMethod::cursorRectangleChanged, this, &AutoScrollController::schedule);
    connect(inputMethod, &QInputMethod::keyboardRectangleChanged, this, [this] {
        if (!m_keyboardRectangleSet) {
            Q_EMIT keyboardRectangleChanged();
            schedule();
        }
    });
    if (auto *item = qobject_cast<QQuickItem *>(parent); item && item->inherits("QQuickFlickable"))
        setFlickable(item);
}

AutoScrollController::~AutoScrollController() = default;

AutoScrollController *AutoScrollController::qmlAttachedProperties(QObject *object)
{
    return new AutoScrollController(object);
}

QQuickItem *AutoScrollController::enclosingFlickable(QQuickItem *item)
{
    for (QQuickItem *above = item ? item->parentItem() : nullptr; above; above = above->parentItem()) {
        if (above->inherits("QQuickFlickable"))
            return above;
    }
    return nullptr;
}

void AutoScrollController::setFlickable(QQuickItem *flickable)
{
    if (flickable == m_flickable)
        return;
    if (m_flickable)
        disconnect(m_flickable, nullptr, this, nullptr);
    m_animation->stop();
    m_flickable = flickable;
    m_animation->setTargetObject(flickable);
    m_animation->setPropertyName(m_orientation == Qt::Vertical ? "contentY" : "contentX");
    if (flickable) {
        connect(flickable, &QQuickItem::windowChanged, this, &AutoScrollController::watchWindow);
        connect(flickable, &QQuickItem::heightChanged, this, &AutoScrollController::schedule);
        connect(flickable, &QQuickItem::widthChanged, this, &AutoScrollController::schedule);
        // The finger takes over from an animation that is still running.
        connect(flickable, SIGNAL(movementStarted()), m_animation, SLOT(stop()));
    }
    watchWindow(flickable ? flickable->window() : nullptr);
    Q_EMIT flickableChanged();
}

void AutoScrollController::watchWindow(QQuickWindow *window)
{
    if (m_window)
        disconnect(m_window, nullptr, this, nullptr);
    m_window = window;
    if (window)
        connect(window, &QQuickWindow::activeFocusItemChanged, this, &AutoScrollController::schedule);
    schedule();
}

void AutoScrollController::setOrientation(Qt::Orientation orientation)
{
    if (orientation == m_orientation)
        return;
    m_orientation = orientation;
    m_animation->stop();
    m_animation->setPropertyName(orientation == Qt::Vertical ? "contentY" : "contentX");
    Q_EMIT orientationChanged();
    schedule();
}

void AutoScrollController::setEnabled(bool enabled)
{
    if (enabled == m_enabled)
        return;
    m_enabled = enabled;
    if (!enabled)
        m_animation->stop();
    Q_EMIT enabledChanged();
    schedule();
}

void AutoScrollController::setAnimated(bool animated)
{
    if (animated == m_animated)
        return;
    m_animated = animated;
    Q_EMIT animatedChanged();
}

void AutoScrollController::setMargin(qreal margin)
{
    if (margin == m_margin)
        return;
    m_margin = margin;
    Q_EMIT marginChanged();
    schedule();
}

QRectF AutoScrollController::keyboardRectangle() const
{
    return m_keyboardRectangleSet ? m_keyboardRectangle : QGuiApplication::inputMethod()->keyboardRectangle();
}

void AutoScrollController::setKeyboardRectangle(const QRectF &rectangle)
{
    if (m_keyboardRectangleSet && rectangle == m_keyboardRectangle)
        return;
    m_keyboardRectangle = rectangle;
    m_keyboardRectangleSet = true;
    Q_EMIT keyboardRectangleChanged();
    schedule();
}

void AutoScrollController::resetKeyboardRectangle()
{
    if (!m_keyboardRectangleSet)
        return;
    m_keyboardRectangleSet = false;
    Q_EMIT keyboardRectangleChanged();
    schedule();
}

void AutoScrollController::schedule()
{
    if (m_enabled && m_flickable)
        m_pending.start();
}

qreal AutoScrollController::keyboardOverlap() const
{
    const QRectF keyboard = keyboardRectangle();
    if (!m_flickable || keyboard.isEmpty())
        return 0;
    const QRectF covered = m_flickable->mapRectFromScene(keyboard) & QRectF(0, 0, m_flickable->width(), m_flickable->height());
    return covered.isEmpty() ? 0 : m_flickable->height() - covered.top();
}

void AutoScrollController::ensureVisible()
{
    m_pending.stop();
    if (!m_enabled || !m_flickable || !m_window)
        return;
    QQuickItem *focus = m_window->activeFocusItem();
    QQuickItem *content = m_flickable->property("contentItem").value<QQuickItem *>();
    if (!focus || !content || !content->isAncestorOf(focus))
        return;

    QRectF cursor = focus->inputMethodQuery(Qt::ImCursorRectangle).toRectF();
    if (!cursor.isValid())
        cursor = QRectF(0, 0, qMax<qreal>(1, focus->width()), qMax<qreal>(1, focus->height()));
    const QRectF wanted = focus->mapRectToItem(m_flickable, cursor).adjusted(-m_margin, -m_margin, m_margin, m_margin);

    const bool vertical = m_orientation == Qt::Vertical;
    const qreal overlap = vertical ? keyboardOverlap() : 0;
    const qreal visibleExtent = (vertical ? m_flickable->height() : m_flickable->width()) - overlap;
    const qreal start = vertical ? wanted.top() : wanted.left();
    const qreal end = vertical ? wanted.bottom() : wanted.right();
    qreal delta = 0;
    if (start < 0 || end - start > visibleExtent)
        delta = start;
    else if (end > visibleExtent)
        delta = end - visibleExtent;
    if (qAbs(delta) < 0.5)
        return;

    const char *position = vertical ? "contentY" : "contentX";
    const qreal origin = m_flickable->property(vertical ? "originY" : "originX").toReal()
            - m_flickable->property(vertical ? "topMargin" : "leftMargin").toReal();
    const qreal contentExtent = m_flickable->property(vertical ? "contentHeight" : "contentWidth").toReal()
            + m_flickable->property(vertical ? "topMargin" : "leftMargin").toReal()
            + m_flickable->property(vertical ? "bottomMargin" : "rightMargin").toReal();
    const qreal last = origin + std::max<qreal>(0, contentExtent - visibleExtent);
    const qreal current = m_animation->state() == QAbstractAnimation::Running
            ? m_animation->endValue().toReal() : m_flickable->property(position).toReal();
    const qreal target = std::clamp(current + delta, origin, std::max(origin, last));
    if (qAbs(target - m_flickable->property(position).toReal()) < 0.5)
        return;

    m_animation->stop();
    if (m_animated) {
        m_animation->setStartValue(m_flickable->property(position));
        m_animation->setEndValue(target);
        m_animation->start();
    } else {
        m_flickable->setProperty(position, target);
    }
}
