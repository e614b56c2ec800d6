#pragma once

#include "window/windoweventobserver.h"

#include <QObject>
#include <QPointer>
#include <QQmlParserStatus>

class DeclarativeWindow;

// The native half of pull-down and push-up menus. Created as a child of the QML menu, it
// watches the flickable, activates the menu while the user drags the content past its
// edge, and when the user lets go with the content moving, decides whether the flick is
// to be turned into a snap back to the menu's resting position (animateFlick()).
//
// Menu and flickable are read by property name only, so any QML menu with the expected
// properties works.
//
// Decisions:
// - dragDistance is how far the content is past the menu's resting position: for a
//   pull-down menu max(0, _inactivePosition - contentY), for a push-up menu
//   max(0, contentY - _inactivePosition).
// - The menu activates when it is out of bounds while the flickable is dragged (also when
//   dragging starts out of bounds), and deactivates once the content is back in bounds.
//   A menu that stays out of bounds after the finger lifts stays active until then.
// - _activationInhibited stops activation (an active menu is left as it is);
//   _changingListView makes the content-position update skip everything, since the list
//   is being repositioned by the toolkit, not dragged by the user.
// - A push-up menu whose _contentColumn has no height has nothing to show and is never
//   out of bounds.
// - Content clamp, for content that fits its view: a pull-down menu stops the content
//   at _maxDragPosition at the bottom when the flickable has no usable push-up menu, and a
//   push-up menu stops it at originY at the top when there is no usable pull-down menu.
// - flickEnded() deactivates a menu that is back in bounds and ends flick monitoring.
// - While the user drags an active menu out, the content follows the finger one to one
//   until the whole menu (the height of the menu item) is out, and at half the finger's
//   pace beyond that. The flickable itself moves content past its edge at half the
//   finger's pace from the start, so each of its positions past the edge is doubled, up
//   to the menu's height, and shifted by half the menu's height beyond it; a menu that
//   fits the view can then be opened entirely by one drag from the edge.
// - canceled tells whether the drag that brought the menu out ended without the finger
//   lifting (the system cancelled the touch, or another item took the mouse grab); it is
//   cleared when the menu activates again. It is seen only through the application
//   window's events, so outside one it stays false.
class PulleyMenuLogic : public QObject, public QQmlParserStatus, public WindowEventObserver
{
    Q_OBJECT
    Q_INTERFACES(QQmlParserStatus)
    Q_PROPERTY(bool pullDownType READ pullDownType WRITE setPullDownType NOTIFY pullDownTypeChanged)
    Q_PROPERTY(QObject *flickable READ flickable WRITE setFlickable NOTIFY flickableChanged)
    Q_PROPERTY(float dragDistance READ dragDistance NOTIFY dragDistanceChanged)
    Q_PROPERTY(bool canceled READ canceled NOTIFY canceledChanged)

public:
    explicit PulleyMenuLogic(QObject *parent = nullptr);
    ~PulleyMenuLogic() override;

    bool pullDownType() const { return m_pullDownType; }
    void setPullDownType(bool pullDown);
    QObject *flickable() const { return m_flickable; }
    void setFlickable(QObject *flickable);
    float dragDistance() const { return m_dragDistance; }
    bool canceled() const { return m_canceled; }

    Q_INVOKABLE bool outOfBounds() const;
    Q_INVOKABLE void monitorFlick();

    void classBegin() override {}
    void componentComplete() override;
    void windowEvent(QEvent *event) override;

    // 0 idle, 1 waiting for the flick to get fast, 2 waiting for it to slow down.
    int monitorState() const { return m_monitorState; }

Q_SIGNALS:
    void finalPositionReached();
    void flickableChanged(QObject *arg);
    void pullDownTypeChanged(bool arg);
    void animateFlick(float duration, float position);
    void dragDistanceChanged();
    void canceledChanged();

public Q_SLOTS:
    void flickableContentYChanged();
    void flickableVerticalVelocityChanged();
    void flickableFlickEnded();
    void flickableDraggingChanged();

private:
    bool menuUsable(const QObject *menu) const;
    void setActive(bool active);
    bool clampContent();
    void followFinger();
    void setCanceled(bool canceled);
    void updateDragDistance();

    QPointer<QObject> m_menu;
    QPointer<QObject> m_flickable;
    QPointer<DeclarativeWindow> m_window;
    bool m_pullDownType = true;
    float m_dragDistance = 0;
    int m_monitorState = 0;
    bool m_updating = false;
    bool m_fingerDown = false;
    bool m_canceled = false;
};
