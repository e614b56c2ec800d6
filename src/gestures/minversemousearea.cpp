#include "minversemousearea.h"

#include <QGuiApplication>
#include <QQuickWindow>
#include <QStyleHints>

namespace {

using Items = QList<QPointer<QQuickItem>>;

void appendItem(QQmlListProperty<QQuickItem> *list, QQuickItem *item)
{
    static_cast<Items *>(list->data)->append(item);
}

int countItems(QQmlListProperty<QQuickItem> *list)
{
    return static_cast<Items *>(list->data)->size();
}

QQuickItem *itemAt(QQmlListProperty<QQuickItem> *list, int index)
{
    return static_cast<Items *>(list->data)->at(index);
}

void clearItems(QQmlListProperty<QQuickItem> *list)
{
    static_cast<Items *>(list->data)->clear();
}

} // namespace

MInverseMouseArea::MInverseMouseArea(QQuickItem *parent)
    : QQuickItem(parent)
{
    connect(this, &QQuickItem::enabledChanged, this, &MInverseMouseArea::watch);
    connect(this, &QQuickItem::visibleChanged, this, &MInverseMouseArea::watch);
}

MInverseMouseArea::~MInverseMouseArea()
{
    if (m_watched)
        m_watched->removeEventFilter(this);
}

QQmlListProperty<QQuickItem> MInverseMouseArea::insideItems()
{
    return QQmlListProperty<QQuickItem>(this, &m_insideItems, appendItem, countItems, itemAt, clearItems);
}

bool MInverseMouseArea::isInside(const QPointF &scenePosition) const
{
    if (contains(mapFromScene(scenePosition)))
        return true;
    for (const QPointer<QQuickItem> &item : m_insideItems) {
        if (item && item->isVisible() && item->contains(item->mapFromScene(scenePosition)))
            return true;
    }
    return false;
}

void MInverseMouseArea::itemChange(ItemChange change, const ItemChangeData &data)
{
    QQuickItem::itemChange(change, data);
    if (change == ItemSceneChange)
        watch();
}

void MInverseMouseArea::watch()
{
    QQuickWindow *target = isEnabled() && isVisible() ? window() : nullptr;
    if (target == m_watched)
        return;
    if (m_watched)
        m_watched->removeEventFilter(this);
    cancel();
    m_watched = target;
    if (target)
        target->installEventFilter(this);
}

bool MInverseMouseArea::eventFilter(QObject *watched, QEvent *event)
{
    if (watched != m_watched)
        return false;
    switch (event->type()) {
    case QEvent::MouseButtonPress: {
        auto mouse = static_cast<QMouseEvent *>(event);
        if (mouse->source() == Qt::MouseEventNotSynthesized && mouse->button() == Qt::LeftButton)
            press(mouse->windowPos());
        break;
    }
    case QEvent::MouseButtonRelease: {
        auto mouse = static_cast<QMouseEvent *>(event);
        if (mouse->source() == Qt::MouseEventNotSynthesized && mouse->button() == Qt::LeftButton)
            release(mouse->windowPos());
        break;
    }
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd: {
        // The first finger down is the one that counts, as for a mouse.
        for (const QTouchEvent::TouchPoint &point : static_cast<QTouchEvent *>(event)->touchPoints()) {
            if (m_touchId < 0 && point.state() == Qt::TouchPointPressed) {
                m_touchId = point.id();
                press(point.pos()); // window coordinates, the scene's
            } else if (point.id() == m_touchId && point.state() == Qt::TouchPointReleased) {
                m_touchId = -1;
                release(point.pos());
            }
        }
        break;
    }
    case QEvent::TouchCancel:
        m_touchId = -1;
        cancel();
        break;
    default:
        break;
    }
    return false; // never taken: the press goes where it would have gone
}

void MInverseMouseArea::press(const QPointF &scenePosition)
{
    if (isInside(scenePosition))
        return;
    m_pressPosition = scenePosition;
    m_pressed = true;
    Q_EMIT pressedChanged();
    const QPointF local = mapFromScene(scenePosition);
    Q_EMIT pressedOutside(local.x(), local.y());
}

void MInverseMouseArea::release(const QPointF &scenePosition)
{
    if (!m_pressed)
        return;
    m_pressed = false;
    Q_EMIT pressedChanged();
    // A drag that started outside is no click, nor is a release that ends inside.
    const int distance = QGuiApplication::styleHints()->startDragDistance();
    if ((scenePosition - m_pressPosition).manhattanLength() > distance || isInside(scenePosition))
        return;
    const QPointF local = mapFromScene(scenePosition);
    Q_EMIT clickedOutside(local.x(), local.y());
}

void MInverseMouseArea::cancel()
{
    if (!m_pressed)
        return;
    m_pressed = false;
    Q_EMIT pressedChanged();
    Q_EMIT canceledOutside();
}
