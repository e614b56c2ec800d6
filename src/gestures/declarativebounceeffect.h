#pragma once

#include "window/windoweventobserver.h"

#include <QObject>
#include <QPointF>
#include <QPointer>
#include <QQmlListProperty>

class DeclarativeWindow;
class QQuickFlickable;
class QQuickItem;

// Measures how far the user keeps dragging past the edge of a flickable, so that the QML
// layer can draw an over-scroll effect from `difference` while `active`. It watches every
// mouse event of the application window (not just those reaching the flickable) while the
// flickable is visible, enabled and interactive. Content that fits its view bounces only
// toward a side that has a pulley menu ("pullDownMenu" / "pushUpMenu" on the flickable).
class DeclarativeBounceEffect : public QObject, public WindowEventObserver
{
    Q_OBJECT
    Q_PROPERTY(bool active READ active NOTIFY activeChanged)
    Q_PROPERTY(float difference READ difference NOTIFY differenceChanged)
    Q_PROPERTY(QQuickItem *flickable READ flickable WRITE setFlickable NOTIFY flickableChanged)
    Q_PROPERTY(QQmlListProperty<QObject> data READ data)
    Q_CLASSINFO("DefaultProperty", "data")

public:
    explicit DeclarativeBounceEffect(QObject *parent = nullptr);
    ~DeclarativeBounceEffect() override;

    bool active() const { return m_active; }
    float difference() const { return m_difference; }
    QQuickItem *flickable() const { return m_flickable; }
    void setFlickable(QQuickItem *flickable);
    QQmlListProperty<QObject> data();

    void activeFlickableChanged();
    void windowEvent(QEvent *event) override;

    Q_INVOKABLE void handlePress(QPointF pos);
    Q_INVOKABLE void handleMove(QPointF pos);
    Q_INVOKABLE void handleRelease();

Q_SIGNALS:
    void differenceChanged();
    void activeChanged();
    void flickableChanged();

private Q_SLOTS:
    void flickableStateChanged() { activeFlickableChanged(); }

private:
    enum Direction { Horizontal = 1, Vertical = 2 };
    // What one event needs of the flickable, read once per event: directly from a Qt
    // Quick Flickable, by property name from anything else.
    struct Geometry {
        int directions = 0;
        bool atXBeginning = false, atXEnd = false, atYBeginning = false, atYEnd = false;
        qreal contentWidth = 0, contentHeight = 0;
    };
    Geometry geometry() const;
    void move(QPointF pos, const Geometry &flickable);
    void deactivate();
    void detach();

    QPointer<QQuickItem> m_flickable;
    QQuickFlickable *m_view = nullptr; // m_flickable as a Flickable, when it is one
    QPointer<DeclarativeWindow> m_window;
    QPointF m_pressPosition;
    QPointF m_anchor;
    float m_difference = 0;
    bool m_active = false;
    bool m_attached = false;
    bool m_pressedInside = false;
};
