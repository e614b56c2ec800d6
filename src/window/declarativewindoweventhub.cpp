#include "window/declarativewindow.h"
#include "window/windoweventobserver.h"

#include <QMouseEvent>
#include <QQuickWindow>
#include <QTouchEvent>
#include <QVarLengthArray>

// The event hub: every pointer event of the window, handed to registered observers, with
// mouse events made from touch for observers written for the mouse.

namespace {

bool isPointerEvent(QEvent::Type type)
{
    switch (type) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseMove:
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
    case QEvent::TouchCancel:
        return true;
    default:
        return false;
    }
}

} // namespace

bool DeclarativeWindow::eventFilter(QObject *watched, QEvent *event)
{
    if (watched != m_window)
        return false;
    if (!m_observers.isEmpty() && isPointerEvent(event->type())) {
        dispatch(event);
    } else if (event->type() == QEvent::Expose && !m_publishedSinceShown && m_window->handle()) {
        // The compositor's side of a window exists once it is first exposed: properties
        // set before that are lost, so they go out again now.
        m_publishedSinceShown = true;
        publishWindowProperties();
    }
    return false;
}

bool DeclarativeWindow::childMouseEventFilter(QQuickItem *item, QEvent *event)
{
    // The window sends the grab loss to the item and its filtering ancestors only.
    if (event->type() == QEvent::UngrabMouse && !m_observers.isEmpty())
        dispatch(event);
    return Pelkan::Control::childMouseEventFilter(item, event);
}

void DeclarativeWindow::dispatch(QEvent *event)
{
    const bool accepted = event->isAccepted();
    // A copy, since an observer may register or unregister others; on the stack, since
    // this runs for every pointer event of the window.
    QVarLengthArray<WindowEventObserver *, 8> observers;
    for (WindowEventObserver *observer : qAsConst(m_observers))
        observers.append(observer);
    for (WindowEventObserver *observer : qAsConst(observers)) {
        // An earlier observer may have unregistered this one.
        if (!m_observers.contains(observer))
            continue;
        observer->windowEvent(event);
        event->setAccepted(accepted);
    }

    // Qt Quick turns touches into mouse events only inside its item delivery, where the
    // window never sees them; observers written for the mouse get the same here. Like a
    // mouse, they follow one finger: the first to go down, until it lifts; the others are
    // ignored until a finger goes down again after that.
    const QEvent::Type type = event->type();
    if (type == QEvent::TouchCancel) {
        m_touchPointId = -1;
        return;
    }
    if (type != QEvent::TouchBegin && type != QEvent::TouchUpdate && type != QEvent::TouchEnd)
        return;
    if (type == QEvent::TouchBegin)
        m_touchPointId = -1; // no finger was down, whatever was missed before
    const QList<QTouchEvent::TouchPoint> points = static_cast<QTouchEvent *>(event)->touchPoints();
    const QTouchEvent::TouchPoint *followed = nullptr;
    for (const QTouchEvent::TouchPoint &point : points) {
        const bool candidate = m_touchPointId < 0 ? point.state() == Qt::TouchPointPressed : point.id() == m_touchPointId;
        if (candidate) {
            followed = &point;
            break;
        }
    }
    if (!followed)
        return;

    QEvent::Type mouseType = QEvent::MouseMove;
    if (m_touchPointId < 0) {
        m_touchPointId = followed->id();
        mouseType = QEvent::MouseButtonPress;
    } else if (followed->state() == Qt::TouchPointReleased || type == QEvent::TouchEnd) {
        m_touchPointId = -1;
        mouseType = QEvent::MouseButtonRelease;
    } else if (followed->state() != Qt::TouchPointMoved) {
        return;
    }
    const Qt::MouseButtons buttons = mouseType == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
    QMouseEvent mouse(mouseType, followed->pos(), followed->pos(), followed->screenPos(), Qt::LeftButton, buttons,
                      Qt::NoModifier, Qt::MouseEventSynthesizedByQt);
    mouse.setTimestamp(static_cast<QTouchEvent *>(event)->timestamp());
    dispatch(&mouse);
}
