#include "declarativetouchblocker.h"

DeclarativeTouchBlocker::DeclarativeTouchBlocker(QQuickItem *parent)
    : QQuickItem(parent)
{
    setAcceptedMouseButtons(Qt::AllButtons);
    setAcceptTouchEvents(true);
    setAcceptHoverEvents(true);
}

void DeclarativeTouchBlocker::mousePressEvent(QMouseEvent *event)
{
    event->accept();
}

void DeclarativeTouchBlocker::mouseMoveEvent(QMouseEvent *event)
{
    event->accept();
}

void DeclarativeTouchBlocker::mouseReleaseEvent(QMouseEvent *event)
{
    event->accept();
}

void DeclarativeTouchBlocker::mouseDoubleClickEvent(QMouseEvent *event)
{
    event->accept();
}

void DeclarativeTouchBlocker::touchEvent(QTouchEvent *event)
{
    event->accept();
}

void DeclarativeTouchBlocker::wheelEvent(QWheelEvent *event)
{
    event->accept();
}

void DeclarativeTouchBlocker::hoverEnterEvent(QHoverEvent *event)
{
    event->accept();
}

void DeclarativeTouchBlocker::hoverMoveEvent(QHoverEvent *event)
{
    event->accept();
}
