#include "declarativebounceeffect.h"
#include "window/declarativewindow.h"
#include "gestures/propertycache.h"

#include <QGuiApplication>
#include <QQuickItem>
#include <QQuickWindow>
#include <QStyleHints>
#include <private/qquickflickable_p.h>

#include <cmath>

using PropertyCache::readBool;
using PropertyCache::readObject;
using PropertyCache::readReal;

namespace {

// Whole pixels, halves away from zero.
QPointF rounded(const QPointF &point)
{
    return QPointF(std::round(point.x()), std::round(point.y()));
}

void appendData(QQmlListProperty<QObject> *list, QObject *object)
{
    if (object)
        object->setParent(list->object);
}

} // namespace

DeclarativeBounceEffect::DeclarativeBounceEffect(QObject *parent)
    : QObject(parent)
{
}

DeclarativeBounceEffect::~DeclarativeBounceEffect()
{
    if (m_window)
        m_window->unregisterObserver(this);
}

QQmlListProperty<QObject> DeclarativeBounceEffect::data()
{
    return QQmlListProperty<QObject>(this, nullptr, &appendData, nullptr, nullptr, nullptr);
}

void DeclarativeBounceEffect::detach()
{
    m_attached = false;
    if (m_window)
        m_window->unregisterObserver(this);
    m_window = nullptr;
}

void DeclarativeBounceEffect::setFlickable(QQuickItem *flickable)
{
    if (flickable == m_flickable)
        return;
    detach();
    if (m_flickable)
        disconnect(m_flickable, nullptr, this, nullptr);
    m_flickable = flickable;
    m_view = qobject_cast<QQuickFlickable *>(flickable);
    if (flickable) {
        connect(flickable, &QQuickItem::visibleChanged, this, &DeclarativeBounceEffect::activeFlickableChanged);
        connect(flickable, &QQuickItem::enabledChanged, this, &DeclarativeBounceEffect::activeFlickableChanged);
        // Flickable is Qt's private class: its interactive signal is reached by name.
        const int interactive = flickable->metaObject()->indexOfSignal("interactiveChanged()");
        if (interactive >= 0) {
            connect(flickable, flickable->metaObject()->method(interactive), this,
                    metaObject()->method(metaObject()->indexOfSlot("flickableStateChanged()")));
        }
        activeFlickableChanged();
    }
    Q_EMIT flickableChanged();
}

void DeclarativeBounceEffect::activeFlickableChanged()
{
    if (!m_flickable)
        return;
    const bool usable = m_flickable->isVisible() && m_flickable->isEnabled()
            && (m_view ? m_view->isInteractive() : readBool(m_flickable, "interactive"));
    if (usable == m_attached)
        return;
    if (!usable) {
        detach();
        if (m_active)
            deactivate();
    } else {
        m_window = DeclarativeWindow::findWindow(m_flickable);
        if (m_window)
            m_window->registerObserver(this);
        m_attached = true;
    }
}

DeclarativeBounceEffect::Geometry DeclarativeBounceEffect::geometry() const
{
    Geometry g;
    if (!m_flickable)
        return g;
    int flickDirection;
    if (m_view) { // every mouse move of the window comes here: no lookups by name
        flickDirection = m_view->flickableDirection();
        g.contentWidth = m_view->contentWidth();
        g.contentHeight = m_view->contentHeight();
        g.atXBeginning = m_view->isAtXBeginning();
        g.atXEnd = m_view->isAtXEnd();
        g.atYBeginning = m_view->isAtYBeginning();
        g.atYEnd = m_view->isAtYEnd();
    } else {
        flickDirection = PropertyCache::read(m_flickable, "flickableDirection").toInt();
        g.contentWidth = readReal(m_flickable, "contentWidth");
        g.contentHeight = readReal(m_flickable, "contentHeight");
        g.atXBeginning = readBool(m_flickable, "atXBeginning");
        g.atXEnd = readBool(m_flickable, "atXEnd");
        g.atYBeginning = readBool(m_flickable, "atYBeginning");
        g.atYEnd = readBool(m_flickable, "atYEnd");
    }
    if ((flickDirection & Horizontal) || (g.contentWidth > 0 && g.contentWidth != m_flickable->width()))
        g.directions |= Horizontal;
    if ((flickDirection & Vertical) || (g.contentHeight > 0 && g.contentHeight != m_flickable->height()))
        g.directions |= Vertical;
    return g;
}

void DeclarativeBounceEffect::deactivate()
{
    m_active = false;
    Q_EMIT activeChanged();
    // Observers read `active`; the distance is left as it was.
    Q_EMIT differenceChanged();
}

void DeclarativeBounceEffect::windowEvent(QEvent *event)
{
    const QEvent::Type type = event->type();
    if (type != QEvent::MouseButtonPress && !m_pressedInside)
        return;
    if (!m_flickable || !m_flickable->window())
        return;

    const Geometry g = geometry();
    bool atEdge = false;
    if (g.directions & Vertical)
        atEdge = g.atYBeginning || g.atYEnd;
    if (!atEdge && (g.directions & Horizontal))
        atEdge = g.atXBeginning || g.atXEnd;
    if (!g.directions || !atEdge) {
        if (m_active)
            deactivate();
        return;
    }

    QQuickWindow *window = m_flickable->window();
    QQuickItem *grabber = window->mouseGrabberItem();
    if (grabber && grabber->keepMouseGrab() && grabber != m_flickable) {
        if (m_active)
            deactivate();
        m_pressedInside = false;
        return;
    }

    switch (type) {
    case QEvent::MouseButtonPress:
        if (!m_pressedInside)
            handlePress(rounded(static_cast<QMouseEvent *>(event)->windowPos()));
        break;
    case QEvent::MouseMove: {
        // The anchor stays in window coordinates while moves are in the flickable's.
        const QPointF position = rounded(static_cast<QMouseEvent *>(event)->windowPos());
        move(m_flickable->mapFromItem(window->contentItem(), position), g);
        break;
    }
    case QEvent::UngrabMouse:
        if (grabber) {
            for (QQuickItem *item = grabber; item; item = item->parentItem()) {
                if (item == m_flickable)
                    return;
            }
            m_pressedInside = false;
            if (m_active)
                deactivate();
        }
        break;
    case QEvent::MouseButtonRelease:
    case QEvent::TouchEnd:
    case QEvent::TouchCancel: // the system took the touch away: over as much as a lift
        m_pressedInside = false;
        if (m_active)
            deactivate();
        break;
    default:
        break;
    }
}

void DeclarativeBounceEffect::handlePress(QPointF pos)
{
    m_pressPosition = m_anchor = pos;
    QQuickWindow *window = m_flickable ? m_flickable->window() : nullptr;
    m_pressedInside = window && m_flickable->contains(m_flickable->mapFromItem(window->contentItem(), pos));
}

void DeclarativeBounceEffect::handleMove(QPointF pos)
{
    move(pos, geometry());
}

void DeclarativeBounceEffect::move(QPointF pos, const Geometry &flickable)
{
    if (!m_flickable || !m_attached)
        return;
    const int t = QGuiApplication::styleHints()->startDragDistance();
    const int dirs = flickable.directions;
    qreal d = 0;
    QPointF anchor = pos;

    if (dirs & Vertical) {
        const qreal dy = pos.y() - m_anchor.y();
        const bool overflows = flickable.contentHeight > m_flickable->height();
        bool qualified = false;
        if (flickable.atYBeginning)
            qualified = dy > 0 && (overflows || readObject(m_flickable, "pullDownMenu"));
        if (qualified) {
            d = dy;
            anchor.setY(pos.y() + qMax<qreal>(0, dy - t));
        } else if (flickable.atYEnd && dy < 0 && (overflows || readObject(m_flickable, "pushUpMenu"))) {
            d = -dy;
            anchor.setY(pos.y() - qMax<qreal>(0, -dy - t));
        }
    }
    if ((dirs & Horizontal) && flickable.contentWidth > m_flickable->width()) {
        const qreal dx = pos.x() - m_anchor.x();
        if (flickable.atXBeginning && dx > d) {
            d = dx;
            anchor.setX(pos.x() + qMax<qreal>(0, dx - t));
        } else if (flickable.atXEnd && dx < -d) {
            d = -dx;
            anchor.setX(pos.x() - qMax<qreal>(0, -dx - t));
        }
    }

    if (!m_active) {
        if (d >= t) {
            m_active = true;
            m_anchor = anchor;
            m_difference = float(d - t);
            Q_EMIT activeChanged();
        }
    } else if (float(d) != m_difference) {
        m_difference = float(d);
        Q_EMIT differenceChanged();
    }
}

void DeclarativeBounceEffect::handleRelease()
{
    if (m_active)
        deactivate();
}
