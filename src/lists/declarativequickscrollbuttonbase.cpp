#include "declarativequickscrollbuttonbase.h"

#include <QEasingCurve>

DeclarativeQuickScrollButtonBase::DeclarativeQuickScrollButtonBase(QQuickItem *parent)
    : QQuickItem(parent)
{
    m_hideTimer.setSingleShot(true);
    m_hideTimer.setInterval(2000);
    connect(&m_hideTimer, &QTimer::timeout, this, [this] { setActive(false); });
    m_animation.setPropertyName("contentY");
    m_animation.setEasingCurve(QEasingCurve::InOutQuad);
    m_animation.setDuration(400);
}

void DeclarativeQuickScrollButtonBase::setFlickable(QQuickItem *flickable)
{
    if (flickable == m_flickable)
        return;
    if (m_flickable)
        disconnect(m_flickable, nullptr, this, nullptr);
    m_flickable = flickable;
    m_animation.setTargetObject(flickable);
    if (flickable) {
        connect(flickable, SIGNAL(contentYChanged()), this, SLOT(contentMoved()));
        connect(flickable, SIGNAL(movementStarted()), this, SLOT(movementStarted()));
        connect(flickable, SIGNAL(movementEnded()), this, SLOT(movementEnded()));
    }
    Q_EMIT flickableChanged();
}

void DeclarativeQuickScrollButtonBase::setPause(int milliseconds)
{
    if (milliseconds == m_hideTimer.interval())
        return;
    m_hideTimer.setInterval(milliseconds);
    Q_EMIT pauseChanged();
}

qreal DeclarativeQuickScrollButtonBase::contentY() const
{
    return m_flickable ? m_flickable->property("contentY").toReal() : 0;
}

void DeclarativeQuickScrollButtonBase::movementStarted()
{
    m_startY = m_lastY = contentY();
    m_hideTimer.stop();
}

void DeclarativeQuickScrollButtonBase::movementEnded()
{
    if (m_active)
        m_hideTimer.start();
}

void DeclarativeQuickScrollButtonBase::contentMoved()
{
    if (!m_flickable || m_animation.state() == QAbstractAnimation::Running
            || !m_flickable->property("moving").toBool())
        return;
    const qreal y = contentY();
    const qreal view = qMax<qreal>(1, m_flickable->height());
    const qreal velocity = m_flickable->property("verticalVelocity").toReal();
    // Long content only: nothing to be quick about in a list of a few views.
    if (m_flickable->property("contentHeight").toReal() < 4 * view)
        return;
    const bool fast = qAbs(velocity) > 2 * view;
    const bool far = qAbs(y - m_startY) > 2 * view;
    if (y != m_lastY) {
        const int direction = y < m_lastY ? Qt::UpArrow : Qt::DownArrow;
        if (direction != m_direction) {
            m_direction = direction;
            Q_EMIT directionChanged();
        }
    }
    m_lastY = y;
    if (fast || far)
        setActive(true);
}

void DeclarativeQuickScrollButtonBase::scroll()
{
    if (!m_flickable)
        return;
    const qreal origin = m_flickable->property("originY").toReal();
    const qreal end = origin + m_flickable->property("contentHeight").toReal() - m_flickable->height();
    QMetaObject::invokeMethod(m_flickable, "cancelFlick");
    m_animation.stop();
    m_animation.setStartValue(contentY());
    m_animation.setEndValue(m_direction == Qt::UpArrow ? origin : qMax(origin, end));
    m_animation.start();
    setActive(false);
}

void DeclarativeQuickScrollButtonBase::setActive(bool active)
{
    if (active == m_active)
        return;
    m_active = active;
    if (!active)
        m_hideTimer.stop();
    Q_EMIT activeChanged();
}
