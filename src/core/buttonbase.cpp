#include "buttonbase.h"
#include "touchfeedback.h"

#include <QGuiApplication>
#include <QKeyEvent>
#include <QLineF>
#include <QMetaMethod>
#include <QStyleHints>

namespace Pelkan {

namespace {
constexpr int RepeatDelay = 300;
constexpr int RepeatInterval = 100;
}

ButtonBase::ButtonBase(QQuickItem *parent)
    : ControlBase(parent)
{
    setAcceptedMouseButtons(Qt::LeftButton);
    setFocusPolicy(Qt::TabFocus);
}

void ButtonBase::setDown(bool down)
{
    m_explicitDown = true;
    if (m_down == down)
        return;
    m_down = down;
    Q_EMIT downChanged();
}

void ButtonBase::resetDown()
{
    if (!m_explicitDown)
        return;
    setDown(m_pressed);
    m_explicitDown = false;
}

void ButtonBase::setCheckable(bool checkable)
{
    if (m_checkable == checkable)
        return;
    m_checkable = checkable;
    setAccessibleState("checkable", checkable);
    defaultAccessibleRoleChanged();
    Q_EMIT checkableChanged();
}

void ButtonBase::setChecked(bool checked)
{
    if (m_checked == checked)
        return;
    m_checked = checked;
    setAccessibleState("checked", checked);
    Q_EMIT checkedChanged();
}

void ButtonBase::setAutoRepeat(bool repeat)
{
    if (m_autoRepeat == repeat)
        return;
    stopTimers();
    m_autoRepeat = repeat;
    Q_EMIT autoRepeatChanged();
}

void ButtonBase::toggle()
{
    setChecked(!m_checked);
}

void ButtonBase::click()
{
    if (!isEnabled())
        return;
    nextCheckState();
    Q_EMIT clicked();
}

void ButtonBase::accessiblePressAction()
{
    click();
}

void ButtonBase::accessibleToggleAction()
{
    if (m_checkable)
        click();
}

QAccessible::Role ButtonBase::defaultAccessibleRole() const
{
    return m_checkable ? QAccessible::CheckBox : QAccessible::Button;
}

void ButtonBase::updateAccessibleStates()
{
    setAccessibleState("pressed", m_pressed);
    setAccessibleState("checkable", m_checkable);
    setAccessibleState("checked", m_checked);
}

void ButtonBase::setPressed(bool pressed)
{
    if (m_pressed == pressed)
        return;
    m_pressed = pressed;
    setAccessibleState("pressed", pressed);
    Q_EMIT pressedChanged();
    if (!m_explicitDown) {
        setDown(pressed);
        m_explicitDown = false;
    }
}

void ButtonBase::setPressPoint(const QPointF &point)
{
    const QPointF previous = m_pressPoint;
    m_pressPoint = point;
    if (!qFuzzyCompare(previous.x(), point.x()))
        Q_EMIT pressXChanged();
    if (!qFuzzyCompare(previous.y(), point.y()))
        Q_EMIT pressYChanged();
}

void ButtonBase::beginPress(const QPointF &point)
{
    setPressPoint(point);
    m_wasHeld = false;
    setPressed(true);
    TouchFeedback::play(this);
    Q_EMIT pressed();
    startTimers();
}

// The end of a press: inside the button it is a click (unless it was held), elsewhere a
// cancel. The check state changes before released(), as clicked() follows it.
void ButtonBase::endPress(bool inside)
{
    const bool wasPressed = m_pressed;
    stopTimers();
    m_pressKey = 0;
    setPressed(false);
    if (!wasPressed || !inside) {
        Q_EMIT canceled();
        return;
    }
    if (!m_wasHeld)
        nextCheckState();
    Q_EMIT released();
    if (!m_wasHeld)
        Q_EMIT clicked();
}

void ButtonBase::cancelPress()
{
    m_pressKey = 0;
    stopTimers();
    if (!m_pressed)
        return;
    setPressed(false);
    Q_EMIT canceled();
}

void ButtonBase::nextCheckState()
{
    if (!m_checkable)
        return;
    setChecked(!m_checked);
    Q_EMIT toggled();
}

bool ButtonBase::isPressAndHoldHandled() const
{
    static const QMetaMethod signal = QMetaMethod::fromSignal(&ButtonBase::pressAndHold);
    return isSignalConnected(signal);
}

void ButtonBase::startTimers()
{
    stopTimers();
    if (m_autoRepeat)
        m_repeatTimer = startTimer(RepeatDelay);
    else if (isPressAndHoldHandled())
        m_holdTimer = startTimer(QGuiApplication::styleHints()->mousePressAndHoldInterval());
}

void ButtonBase::stopTimers()
{
    if (m_holdTimer)
        killTimer(m_holdTimer);
    if (m_repeatTimer)
        killTimer(m_repeatTimer);
    m_holdTimer = 0;
    m_repeatTimer = 0;
}

void ButtonBase::timerEvent(QTimerEvent *event)
{
    if (event->timerId() == m_holdTimer) {
        stopTimers();
        m_wasHeld = true;
        Q_EMIT pressAndHold();
    } else if (event->timerId() == m_repeatTimer) {
        killTimer(m_repeatTimer);
        m_repeatTimer = startTimer(RepeatInterval);
        Q_EMIT released();
        Q_EMIT clicked();
        Q_EMIT pressed();
    } else {
        ControlBase::timerEvent(event);
    }
}

void ButtonBase::mousePressEvent(QMouseEvent *event)
{
    if (event->button() != Qt::LeftButton || m_pressKey) {
        event->ignore();
        return;
    }
    ControlBase::mousePressEvent(event);
    beginPress(event->localPos());
    event->accept();
}

// A finger that leaves the button lets go of it (down turns off); coming back presses it
// again. Moving more than the drag distance ends a wait for press-and-hold.
void ButtonBase::mouseMoveEvent(QMouseEvent *event)
{
    if (m_pressKey)
        return;
    const QPointF point = event->localPos();
    const bool inside = contains(point);
    if (m_holdTimer && (!inside || QLineF(m_pressPoint, point).length() > QGuiApplication::styleHints()->startDragDistance()))
        stopTimers();
    setPressPoint(point);
    setPressed(inside);
    if (!inside && m_autoRepeat)
        stopTimers();
    event->accept();
}

void ButtonBase::mouseReleaseEvent(QMouseEvent *event)
{
    if (m_pressKey || event->button() != Qt::LeftButton)
        return;
    ControlBase::mouseReleaseEvent(event);
    // Inside is what the moves said: a button that moved under a still finger (a row whose
    // neighbour closed its menu) is still the one pressed.
    setPressPoint(event->localPos());
    endPress(m_pressed);
    event->accept();
}

void ButtonBase::mouseUngrabEvent()
{
    if (!m_pressKey)
        cancelPress();
}

bool ButtonBase::isClickKey(int key)
{
    return key == Qt::Key_Space || key == Qt::Key_Enter || key == Qt::Key_Return || key == Qt::Key_Select;
}

void ButtonBase::keyPressEvent(QKeyEvent *event)
{
    if (!isClickKey(event->key()) || event->modifiers() & ~Qt::KeypadModifier) {
        ControlBase::keyPressEvent(event);
        return;
    }
    event->accept();
    // The keyboard's own repeat is ignored: autoRepeat repeats on its own clock.
    if (event->isAutoRepeat() || m_pressed)
        return;
    m_pressKey = event->key();
    beginPress(QPointF(width() / 2, height() / 2));
}

void ButtonBase::keyReleaseEvent(QKeyEvent *event)
{
    if (event->key() != m_pressKey || !m_pressKey) {
        ControlBase::keyReleaseEvent(event);
        return;
    }
    event->accept();
    if (event->isAutoRepeat())
        return;
    endPress(true);
}

void ButtonBase::focusOutEvent(QFocusEvent *event)
{
    ControlBase::focusOutEvent(event);
    if (m_pressKey)
        cancelPress();
}

} // namespace Pelkan
