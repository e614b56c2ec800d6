#pragma once

#include "controlbase.h"

#include <QPointF>

namespace Pelkan {

// RangeBase: a value picked along a horizontal track — sliders. The track runs from
// `leftPadding` to the width less `rightPadding` (right to left when mirrored); `position`
// and `visualPosition` place the handle for the look.
// - A tap sets the value where the finger lifts; a drag that goes sideways first takes the
//   gesture (the value follows the finger, the flickable and page around keep still), one
//   that goes up or down first is left to them and changes nothing.
// - Keys on the focused control: Left and Right (swapped when mirrored), Up and Down move a
//   step; Page Up and Page Down a tenth of the range; Home and End to the ends.
// - moved() only for changes the user made; released() when the finger lifts after a press.
// - Assistive technology reads the value, its bounds and step, and can increase and
//   decrease it.
// Values the user sets snap to `stepSize` counted from the minimum (0: no steps). Names
// follow Qt Quick Controls 2's Slider; `from` and `to` are the same as the minimum and
// maximum.
class RangeBase : public ControlBase
{
    Q_OBJECT
    // The value, kept between the minimum and the maximum.
    Q_PROPERTY(qreal value READ value WRITE setValue NOTIFY valueChanged)
    Q_PROPERTY(qreal minimumValue READ minimumValue WRITE setMinimumValue NOTIFY minimumValueChanged)
    Q_PROPERTY(qreal maximumValue READ maximumValue WRITE setMaximumValue NOTIFY maximumValueChanged)
    Q_PROPERTY(qreal from READ minimumValue WRITE setMinimumValue NOTIFY minimumValueChanged)
    Q_PROPERTY(qreal to READ maximumValue WRITE setMaximumValue NOTIFY maximumValueChanged)
    // The steps user changes snap to; 0 for none.
    Q_PROPERTY(qreal stepSize READ stepSize WRITE setStepSize NOTIFY stepSizeChanged)
    // 0 to 1: where the value lies in the range; visualPosition counts from the left edge.
    Q_PROPERTY(qreal position READ position NOTIFY positionChanged)
    Q_PROPERTY(qreal visualPosition READ visualPosition NOTIFY visualPositionChanged)
    // A finger or the mouse is on the control.
    Q_PROPERTY(bool pressed READ isPressed NOTIFY pressedChanged)
    Q_PROPERTY(bool down READ isPressed NOTIFY pressedChanged)
    // Where the track starts and ends inside the control.
    Q_PROPERTY(qreal leftPadding READ leftPadding WRITE setLeftPadding NOTIFY leftPaddingChanged)
    Q_PROPERTY(qreal rightPadding READ rightPadding WRITE setRightPadding NOTIFY rightPaddingChanged)

public:
    explicit RangeBase(QQuickItem *parent = nullptr);

    qreal value() const { return m_value; }
    void setValue(qreal value);
    qreal minimumValue() const { return m_minimum; }
    void setMinimumValue(qreal minimum);
    qreal maximumValue() const { return m_maximum; }
    void setMaximumValue(qreal maximum);
    qreal stepSize() const { return m_stepSize; }
    void setStepSize(qreal step);
    qreal position() const;
    qreal visualPosition() const;
    bool isPressed() const { return m_pressed; }
    qreal leftPadding() const { return m_leftPadding; }
    void setLeftPadding(qreal padding);
    qreal rightPadding() const { return m_rightPadding; }
    void setRightPadding(qreal padding);

    // The value at a position (0 to 1) of the range, not snapped.
    Q_INVOKABLE qreal valueAt(qreal position) const;
    // A step up or down, as the arrow keys do (without moved()).
    Q_INVOKABLE void increase();
    Q_INVOKABLE void decrease();

    Q_INVOKABLE void accessibleIncreaseAction();
    Q_INVOKABLE void accessibleDecreaseAction();

Q_SIGNALS:
    void valueChanged();
    void minimumValueChanged();
    void maximumValueChanged();
    void stepSizeChanged();
    void positionChanged();
    void visualPositionChanged();
    void pressedChanged();
    void leftPaddingChanged();
    void rightPaddingChanged();
    void moved();
    void released();

protected:
    QAccessible::Role defaultAccessibleRole() const override { return QAccessible::Slider; }

    void componentComplete() override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void mouseUngrabEvent() override;
    void keyPressEvent(QKeyEvent *event) override;

private:
    qreal step() const;
    qreal snapped(qreal value) const;
    qreal bounded(qreal value) const;
    qreal positionAt(const QPointF &point) const;
    void moveBy(qreal delta);
    void moveTo(qreal value);
    void setPressed(bool pressed);
    void rangeChanged();

    qreal m_value = 0;
    qreal m_minimum = 0;
    qreal m_maximum = 1;
    qreal m_stepSize = 0;
    qreal m_leftPadding = 0;
    qreal m_rightPadding = 0;
    QPointF m_pressPoint;
    bool m_pressed = false;
};

} // namespace Pelkan
