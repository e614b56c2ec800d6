#pragma once

class QEvent;

// Something that watches every mouse and touch event of an application window, such as
// an over-scroll effect or a pull-down menu. Register it with DeclarativeWindow; it is
// handed each event in window coordinates before the window delivers it, plus the
// QEvent::UngrabMouse that tells which item lost the mouse grab. A touch is followed by a
// mouse press, move or release made from its first point (flagged as synthesized), since
// Qt Quick's own touch-to-mouse events never pass through the window. An observer must not
// consume events (their accepted state is restored after each observer) and must
// unregister itself before it is destroyed.
class WindowEventObserver
{
public:
    virtual ~WindowEventObserver() = default;
    virtual void windowEvent(QEvent *event) = 0;
};
