#include "dragdetectoritem.h"
#include "enums/declarativetouchinteraction.h"

#include <QGuiApplication>
#include <QMouseEvent>
#include <QStyleHints>

DragDetectorItem::DragDetectorItem(QQuickItem *parent)
    : QQuickItem(parent)
{
    setFiltersChildMouseEvents(true);
    setAcceptedMouseButtons(Qt::LeftButton);
}

bool DragDetectorItem::childMouseEventFilter(QQuickItem *, QEvent *event)
{
    switch (event->type()) {
    case QEvent::MouseButtonPress:
        press(static_cast<QMouseEvent *>(event)->windowPos());
        break;
    case QEvent::MouseMove:
        move(static_cast<QMouseEvent *>(event)->windowPos());
        break;
    case QEvent::MouseButtonRelease:
    case QEvent::UngrabMouse:
        end();
        break;
    default:
        break;
    }
    return false; // only watching
}

void DragDetectorItem::mousePressEvent(QMouseEvent *event)
{
    // Nothing below took the press: there is nothing to watch.
    event->ignore();
}

void DragDetectorItem::mouseUngrabEvent()
{
    end();
}

void DragDetectorItem::press(const QPointF &scenePosition)
{
    m_pressPosition = scenePosition;
    m_distance = QPointF();
    if (!m_pressed) {
        m_pressed = true;
        Q_EMIT pressedChanged();
    }
}

void DragDetectorItem::move(const QPointF &scenePosition)
{
    if (!m_pressed)
        return;
    const QPointF distance = scenePosition - m_pressPosition;
    if (distance != m_distance) {
        m_distance = distance;
        Q_EMIT distanceChanged();
    }
    if (m_dragging)
        return;
    const int threshold = QGuiApplication::styleHints()->startDragDistance();
    if (qAbs(distance.x()) <= threshold && qAbs(distance.y()) <= threshold)
        return;
    m_direction = qAbs(distance.x()) > qAbs(distance.y())
            ? (distance.x() < 0 ? DeclarativeTouchInteraction::Left : DeclarativeTouchInteraction::Right)
            : (distance.y() < 0 ? DeclarativeTouchInteraction::Up : DeclarativeTouchInteraction::Down);
    m_dragging = true;
    Q_EMIT draggingChanged();
    Q_EMIT dragStarted(m_direction);
}

void DragDetectorItem::end()
{
    if (m_dragging) {
        m_dragging = false;
        Q_EMIT draggingChanged();
        Q_EMIT dragEnded();
    }
    if (m_pressed) {
        m_pressed = false;
        Q_EMIT pressedChanged();
    }
}
