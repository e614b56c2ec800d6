#include "rangebase.h"

#include <QGuiApplication>
#include <QKeyEvent>
#include <QStyleHints>
#include <QtMath>

namespace Pelkan {

RangeBase::RangeBase(QQuickItem *parent)
    : ControlBase(parent)
{
    setAcceptedMouseButtons(Qt::LeftButton);
    setFocusPolicy(Qt::TabFocus);
    connect(this, &ControlBase::mirroredChanged, this, &RangeBase::visualPositionChanged);
}

// Until the component is complete the value is kept as given, so that the order in which
// value and bounds are declared does not matter.
void RangeBase::setValue(qreal value)
{
    if (isComponentComplete())
        value = bounded(value);
    if (qFuzzyCompare(1 + m_value, 1 + value))
        return;
    m_value = value;
    Q_EMIT valueChanged();
    Q_EMIT positionChanged();
    Q_EMIT visualPositionChanged();
    sendAccessibleValueChange(m_value);
}

void RangeBase::setMinimumValue(qreal minimum)
{
    if (qFuzzyCompare(1 + m_minimum, 1 + minimum))
        return;
    m_minimum = minimum;
    Q_EMIT minimumValueChanged();
    rangeChanged();
}

void RangeBase::setMaximumValue(qreal maximum)
{
    if (qFuzzyCompare(1 + m_maximum, 1 + maximum))
        return;
    m_maximum = maximum;
    Q_EMIT maximumValueChanged();
    rangeChanged();
}

void RangeBase::rangeChanged()
{
    if (isComponentComplete())
        setValue(m_value);
    Q_EMIT positionChanged();
    Q_EMIT visualPositionChanged();
}

void RangeBase::setStepSize(qreal step)
{
    if (qFuzzyCompare(1 + m_stepSize, 1 + step) || step < 0)
        return;
    m_stepSize = step;
    Q_EMIT stepSizeChanged();
}

void RangeBase::setLeftPadding(qreal padding)
{
    if (qFuzzyCompare(1 + m_leftPadding, 1 + padding))
        return;
    m_leftPadding = padding;
    Q_EMIT leftPaddingChanged();
}

void RangeBase::setRightPadding(qreal padding)
{
    if (qFuzzyCompare(1 + m_rightPadding, 1 + padding))
        return;
    m_rightPadding = padding;
    Q_EMIT rightPaddingChanged();
}

qreal RangeBase::position() const
{
    const qreal range = m_maximum - m_minimum;
    if (qFuzzyIsNull(range))
        return 0;
    return qBound<qreal>(0, (m_value - m_minimum) / range, 1);
}

qreal RangeBase::visualPosition() const
{
    return isMirrored() ? 1 - position() : position();
}

qreal RangeBase::valueAt(qreal position) const
{
    return m_minimum + (m_maximum - m_minimum) * qBound<qreal>(0, position, 1);
}

qreal RangeBase::bounded(qreal value) const
{
    return m_minimum <= m_maximum ? qBound(m_minimum, value, m_maximum) : qBound(m_maximum, value, m_minimum);
}

qreal RangeBase::snapped(qreal value) const
{
    if (m_stepSize <= 0)
        return bounded(value);
    return bounded(m_minimum + qRound((value - m_minimum) / m_stepSize) * m_stepSize);
}

// A step: stepSize, or a hundredth of the range without one.
qreal RangeBase::step() const
{
    return m_stepSize > 0 ? m_stepSize : qAbs(m_maximum - m_minimum) / 100;
}

qreal RangeBase::positionAt(const QPointF &point) const
{
    const qreal length = width() - m_leftPadding - m_rightPadding;
    const qreal along = length > 0 ? qBound<qreal>(0, (point.x() - m_leftPadding) / length, 1) : 0;
    return isMirrored() ? 1 - along : along;
}

void RangeBase::moveTo(qreal value)
{
    const qreal before = m_value;
    setValue(snapped(value));
    if (!qFuzzyCompare(1 + before, 1 + m_value))
        Q_EMIT moved();
}

void RangeBase::moveBy(qreal delta)
{
    moveTo(m_value + (m_maximum >= m_minimum ? delta : -delta));
}

void RangeBase::increase()
{
    setValue(snapped(m_value + step()));
}

void RangeBase::decrease()
{
    setValue(snapped(m_value - step()));
}

void RangeBase::accessibleIncreaseAction()
{
    moveBy(step());
}

void RangeBase::accessibleDecreaseAction()
{
    moveBy(-step());
}

void RangeBase::componentComplete()
{
    ControlBase::componentComplete();
    setValue(m_value);
}

void RangeBase::setPressed(bool pressed)
{
    if (m_pressed == pressed)
        return;
    m_pressed = pressed;
    setAccessibleState("pressed", pressed);
    Q_EMIT pressedChanged();
}

void RangeBase::mousePressEvent(QMouseEvent *event)
{
    if (event->button() != Qt::LeftButton) {
        event->ignore();
        return;
    }
    ControlBase::mousePressEvent(event);
    m_pressPoint = event->localPos();
    setPressed(true);
    event->accept();
}

// Sideways past the drag distance, before going as far up or down: the drag is the
// control's, kept from flickables and the page stack. Until then nothing moves.
void RangeBase::mouseMoveEvent(QMouseEvent *event)
{
    if (!m_pressed)
        return;
    const QPointF point = event->localPos();
    if (!keepMouseGrab()) {
        const qreal dx = qAbs(point.x() - m_pressPoint.x());
        const qreal dy = qAbs(point.y() - m_pressPoint.y());
        if (dx > QGuiApplication::styleHints()->startDragDistance() && dx > dy)
            setKeepMouseGrab(true);
    }
    if (keepMouseGrab())
        moveTo(valueAt(positionAt(point)));
    event->accept();
}

void RangeBase::mouseReleaseEvent(QMouseEvent *event)
{
    if (!m_pressed || event->button() != Qt::LeftButton)
        return;
    ControlBase::mouseReleaseEvent(event);
    moveTo(valueAt(positionAt(event->localPos())));
    setKeepMouseGrab(false);
    setPressed(false);
    event->accept();
    Q_EMIT released();
}

void RangeBase::mouseUngrabEvent()
{
    setKeepMouseGrab(false);
    setPressed(false);
}

void RangeBase::keyPressEvent(QKeyEvent *event)
{
    const qreal range = qAbs(m_maximum - m_minimum);
    const qreal page = qMax(step(), range / 10);
    const qreal forward = isMirrored() ? -1 : 1;
    switch (event->key()) {
    case Qt::Key_Right:
        moveBy(forward * step());
        break;
    case Qt::Key_Left:
        moveBy(-forward * step());
        break;
    case Qt::Key_Up:
        moveBy(step());
        break;
    case Qt::Key_Down:
        moveBy(-step());
        break;
    case Qt::Key_PageUp:
        moveBy(page);
        break;
    case Qt::Key_PageDown:
        moveBy(-page);
        break;
    case Qt::Key_Home:
        moveTo(m_minimum);
        break;
    case Qt::Key_End:
        moveTo(m_maximum);
        break;
    default:
        ControlBase::keyPressEvent(event);
        return;
    }
    event->accept();
}

} // namespace Pelkan
