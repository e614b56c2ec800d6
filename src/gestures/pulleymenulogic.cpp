#include "pulleymenulogic.h"
#include "window/declarativewindow.h"
#include "gestures/propertycache.h"

#include <QQuickItem>

#include <cmath>

using PropertyCache::readBool;
using PropertyCache::readObject;
using PropertyCache::readReal;

namespace {

// Pulls the predicted end of a flick back toward where the flick started.
const qreal PredictionPullBack = 7.0;

} // namespace

PulleyMenuLogic::PulleyMenuLogic(QObject *parent)
    : QObject(parent)
{
    connect(this, &PulleyMenuLogic::finalPositionReached, this, [this] { m_monitorState = 0; });
}

PulleyMenuLogic::~PulleyMenuLogic()
{
    if (m_window)
        m_window->unregisterObserver(this);
}

void PulleyMenuLogic::componentComplete()
{
    m_menu = parent();
}

void PulleyMenuLogic::setPullDownType(bool pullDown)
{
    if (pullDown == m_pullDownType)
        return;
    m_pullDownType = pullDown;
    Q_EMIT pullDownTypeChanged(pullDown);
}

void PulleyMenuLogic::setFlickable(QObject *flickable)
{
    if (flickable == m_flickable)
        return;
    if (m_flickable)
        disconnect(m_flickable, nullptr, this, nullptr);
    setActive(false);
    m_flickable = flickable;
    if (flickable) {
        const QMetaObject *meta = flickable->metaObject();
        const QMetaObject *self = metaObject();
        const struct { const char *signal; const char *slot; } links[] = {
            { "contentYChanged()", "flickableContentYChanged()" },
            { "verticalVelocityChanged()", "flickableVerticalVelocityChanged()" },
            { "flickEnded()", "flickableFlickEnded()" },
            { "draggingChanged()", "flickableDraggingChanged()" },
        };
        for (const auto &link : links) {
            const int signal = meta->indexOfSignal(link.signal);
            if (signal >= 0)
                connect(flickable, meta->method(signal), this, self->method(self->indexOfSlot(link.slot)));
        }
    }
    Q_EMIT flickableChanged(flickable);
}

bool PulleyMenuLogic::menuUsable(const QObject *menu) const
{
    return menu && readBool(menu, "enabled") && readBool(menu, "visible");
}

bool PulleyMenuLogic::outOfBounds() const
{
    if (!m_flickable || !menuUsable(m_menu))
        return false;
    const qreal inactive = readReal(m_menu, "_inactivePosition");
    const qreal contentY = readReal(m_flickable, "contentY");
    if (m_pullDownType)
        return inactive > contentY;
    // An empty push-up menu has nothing to expose.
    QObject *column = readObject(m_menu, "_contentColumn");
    const bool hasContent = !column || readReal(column, "height") > 0;
    return hasContent && contentY > inactive;
}

void PulleyMenuLogic::setActive(bool active)
{
    if (!m_menu)
        return;
    if (active) {
        // Activation happens only while the content is dragged: a finger (or the mouse) is down.
        m_fingerDown = true;
        setCanceled(false);
        PropertyCache::write(m_menu, "active", true);
        if (!m_window) {
            m_window = DeclarativeWindow::findWindow(qobject_cast<QQuickItem *>(m_flickable));
            if (m_window)
                m_window->registerObserver(this);
        }
    } else {
        if (readBool(m_menu, "active"))
            PropertyCache::write(m_menu, "active", false);
        if (m_window)
            m_window->unregisterObserver(this);
        m_window = nullptr;
    }
}

void PulleyMenuLogic::setCanceled(bool canceled)
{
    if (canceled == m_canceled)
        return;
    m_canceled = canceled;
    Q_EMIT canceledChanged();
}

void PulleyMenuLogic::windowEvent(QEvent *event)
{
    // Events reach observers before the window delivers them, so by the time the
    // flickable reports the end of its drag, this knows how the drag ended.
    switch (event->type()) {
    case QEvent::MouseButtonRelease:
        m_fingerDown = false;
        break;
    case QEvent::TouchCancel:
    case QEvent::UngrabMouse:
        if (m_fingerDown) {
            m_fingerDown = false;
            setCanceled(true);
        }
        break;
    default:
        break;
    }
}

void PulleyMenuLogic::followFinger()
{
    auto *menu = qobject_cast<QQuickItem *>(m_menu.data());
    if (!menu)
        return;
    const qreal inactive = readReal(m_menu, "_inactivePosition");
    const qreal contentY = readReal(m_flickable, "contentY");
    const qreal pulled = m_pullDownType ? inactive - contentY : contentY - inactive;
    if (pulled <= 0)
        return;
    const qreal extent = menu->height();
    const qreal follow = pulled <= extent / 2 ? 2 * pulled : pulled + extent / 2;
    PropertyCache::write(m_flickable, "contentY", m_pullDownType ? inactive - follow : inactive + follow);
}

void PulleyMenuLogic::updateDragDistance()
{
    const qreal inactive = readReal(m_menu, "_inactivePosition");
    const qreal contentY = readReal(m_flickable, "contentY");
    const float distance = float(qMax<qreal>(0, m_pullDownType ? inactive - contentY : contentY - inactive));
    if (distance != m_dragDistance) {
        m_dragDistance = distance;
        Q_EMIT dragDistanceChanged();
    }
}

bool PulleyMenuLogic::clampContent()
{
    if (readBool(m_menu, "active"))
        return false;
    if (!readBool(m_flickable, "moving") && !readBool(m_flickable, "flickingVertically"))
        return false;
    if (readReal(m_flickable, "height") < readReal(m_flickable, "contentHeight"))
        return false;

    const qreal contentY = readReal(m_flickable, "contentY");
    if (m_pullDownType && !menuUsable(readObject(m_flickable, "pushUpMenu"))) {
        const qreal limit = readReal(m_menu, "_maxDragPosition");
        if (contentY > limit)
            return PropertyCache::write(m_flickable, "contentY", limit);
    } else if (!m_pullDownType && !menuUsable(readObject(m_flickable, "pullDownMenu"))) {
        const qreal origin = readReal(m_flickable, "originY");
        if (origin > contentY)
            return PropertyCache::write(m_flickable, "contentY", origin);
    }
    return false;
}

void PulleyMenuLogic::flickableContentYChanged()
{
    if (m_updating || !m_menu || !m_flickable)
        return;
    if (readBool(m_menu, "_changingListView"))
        return;
    m_updating = true;
    QPointer<PulleyMenuLogic> self(this);

    const bool out = outOfBounds();
    const bool dragging = readBool(m_flickable, "dragging");
    const bool active = readBool(m_menu, "active");
    if (out && !active && dragging && !readBool(m_menu, "_activationInhibited"))
        setActive(true);
    else if (!out && active)
        setActive(false);
    if (out && dragging && readBool(m_menu, "active"))
        followFinger();
    clampContent();
    updateDragDistance();
    if (readReal(m_flickable, "contentY") == readReal(m_menu, "_finalPosition"))
        Q_EMIT finalPositionReached();

    if (self)
        m_updating = false;
}

void PulleyMenuLogic::flickableDraggingChanged()
{
    if (!m_menu || !m_flickable)
        return;
    if (readBool(m_flickable, "dragging") && outOfBounds() && !readBool(m_menu, "active")
            && !readBool(m_menu, "_activationInhibited")) {
        setActive(true);
    }
}

void PulleyMenuLogic::flickableFlickEnded()
{
    if (!m_menu || !m_flickable)
        return;
    m_monitorState = 0;
    if (readBool(m_menu, "active") && !outOfBounds())
        setActive(false);
}

void PulleyMenuLogic::monitorFlick()
{
    m_monitorState = 1;
}

void PulleyMenuLogic::flickableVerticalVelocityChanged()
{
    if (m_monitorState == 0 || !m_menu || !m_flickable)
        return;
    const qreal v = readReal(m_flickable, "verticalVelocity");
    const qreal s = readReal(m_menu, "_snapCalculationVelocity");
    if (m_monitorState == 1) {
        if (qAbs(v) > s)
            m_monitorState = 2;
        return;
    }
    if (qAbs(v) >= s)
        return;

    const qreal decel = readReal(m_flickable, "flickDeceleration");
    const qreal contentY = readReal(m_flickable, "contentY");
    const qreal time = qAbs(v / decel);
    const qreal distance = 0.5 * v * time;
    const qreal predicted = contentY + distance + (v >= 0 ? -PredictionPullBack : PredictionPullBack);

    const qreal inactive = readReal(m_menu, "_inactivePosition");
    const qreal threshold = readReal(m_menu, "_snapThreshold");
    const bool snap = readBool(m_menu, "_pullDown")
            ? predicted > inactive && predicted - inactive < threshold
            : inactive > predicted && inactive - predicted < threshold;

    QPointer<PulleyMenuLogic> self(this);
    if (snap) {
        const float duration = std::pow(float(std::fabs(2.0 * (contentY - inactive) / decel)), 0.5f);
        Q_EMIT animateFlick(duration, float(inactive));
    }
    // A handler of the signal may have destroyed the menu and this logic with it.
    if (self)
        m_monitorState = 0;
}
