#pragma once

#include "controlbase.h"

#include <QPointF>

namespace Pelkan {

// ButtonBase: anything pressed to act — buttons, switches, rows of a list, menu items, tabs.
// Touch, mouse and the keyboard (Space, Enter and Return, on the focused control) press it
// alike and give the same signals, in this order: pressed(), then on release inside
// released(), toggled() for a checkable button, and clicked(); a press that leaves the button
// or loses the grab (a flickable taking the drag) ends in canceled() instead. A press held
// still for the platform's press-and-hold time emits pressAndHold() when something handles
// it, and is then not also a click; with autoRepeat a held press clicks repeatedly instead.
// Each press plays the touch tone once. Names and meanings follow Qt Quick Controls 2's
// AbstractButton. A touch-first default: Tab reaches a button, a tap does not take the focus
// (an open keyboard stays up while a Send button is tapped); set focusPolicy to change it.
class ButtonBase : public ControlBase
{
    Q_OBJECT
    // Physically pressed: by a finger, the mouse or a key.
    Q_PROPERTY(bool pressed READ isPressed NOTIFY pressedChanged)
    // Drawn pressed: follows `pressed` unless set; set to undefined to follow it again.
    Q_PROPERTY(bool down READ isDown WRITE setDown RESET resetDown NOTIFY downChanged)
    // A click toggles `checked`.
    Q_PROPERTY(bool checkable READ isCheckable WRITE setCheckable NOTIFY checkableChanged)
    Q_PROPERTY(bool checked READ isChecked WRITE setChecked NOTIFY checkedChanged)
    // A held press clicks again and again (after 300 ms, every 100 ms) instead of pressAndHold().
    Q_PROPERTY(bool autoRepeat READ autoRepeat WRITE setAutoRepeat NOTIFY autoRepeatChanged)
    // Where the last press or move was, in the button's coordinates.
    Q_PROPERTY(qreal pressX READ pressX NOTIFY pressXChanged)
    Q_PROPERTY(qreal pressY READ pressY NOTIFY pressYChanged)

public:
    explicit ButtonBase(QQuickItem *parent = nullptr);

    bool isPressed() const { return m_pressed; }
    bool isDown() const { return m_down; }
    void setDown(bool down);
    void resetDown();
    bool isCheckable() const { return m_checkable; }
    void setCheckable(bool checkable);
    bool isChecked() const { return m_checked; }
    void setChecked(bool checked);
    bool autoRepeat() const { return m_autoRepeat; }
    void setAutoRepeat(bool repeat);
    qreal pressX() const { return m_pressPoint.x(); }
    qreal pressY() const { return m_pressPoint.y(); }

    // Toggles `checked`, as a click on a checkable button does (without the click).
    Q_INVOKABLE void toggle();
    // What a click does, from code: toggled() where checkable, then clicked().
    Q_INVOKABLE void click();

    // Assistive technology pressing or toggling the button.
    Q_INVOKABLE void accessiblePressAction();
    Q_INVOKABLE void accessibleToggleAction();

Q_SIGNALS:
    void pressed();
    void released();
    void canceled();
    void clicked();
    void pressAndHold();
    void toggled();
    void pressedChanged();
    void downChanged();
    void checkableChanged();
    void checkedChanged();
    void autoRepeatChanged();
    void pressXChanged();
    void pressYChanged();

protected:
    QAccessible::Role defaultAccessibleRole() const override;
    void updateAccessibleStates() override;

    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void mouseUngrabEvent() override;
    void keyPressEvent(QKeyEvent *event) override;
    void keyReleaseEvent(QKeyEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;
    void timerEvent(QTimerEvent *event) override;

private:
    static bool isClickKey(int key);
    void setPressed(bool pressed);
    void setPressPoint(const QPointF &point);
    void beginPress(const QPointF &point);
    void endPress(bool inside);
    void cancelPress();
    void nextCheckState();
    void startTimers();
    void stopTimers();
    bool isPressAndHoldHandled() const;

    QPointF m_pressPoint;
    int m_holdTimer = 0;
    int m_repeatTimer = 0;
    int m_pressKey = 0; // the key holding the button down, 0 for a finger or the mouse
    bool m_pressed = false;
    bool m_down = false;
    bool m_explicitDown = false;
    bool m_checkable = false;
    bool m_checked = false;
    bool m_autoRepeat = false;
    bool m_wasHeld = false;
};

} // namespace Pelkan
