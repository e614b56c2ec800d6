#pragma once

#include <QPointer>
#include <QPropertyAnimation>
#include <QQuickItem>
#include <QTimer>

// The native half of the quick-scroll button of long lists: it watches a flickable and
// becomes active after fast scrolling (faster than two views a second) or long scrolling
// (more than two views in one movement), offering to go to the end the content was moving
// towards, and stops being active a pause after the movement ends. scroll() takes the view
// to that end with an animation. The QML button draws itself from `active` and `direction`.
class DeclarativeQuickScrollButtonBase : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(QQuickItem *flickable READ flickable WRITE setFlickable NOTIFY flickableChanged)
    Q_PROPERTY(bool active READ active NOTIFY activeChanged)
    // Qt::UpArrow to go to the top, Qt::DownArrow to the bottom.
    Q_PROPERTY(int direction READ direction NOTIFY directionChanged)
    Q_PROPERTY(int pause READ pause WRITE setPause NOTIFY pauseChanged)

public:
    explicit DeclarativeQuickScrollButtonBase(QQuickItem *parent = nullptr);

    QQuickItem *flickable() const { return m_flickable; }
    void setFlickable(QQuickItem *flickable);
    bool active() const { return m_active; }
    int direction() const { return m_direction; }
    int pause() const { return m_hideTimer.interval(); }
    void setPause(int milliseconds);

    Q_INVOKABLE void scroll();

Q_SIGNALS:
    void flickableChanged();
    void activeChanged();
    void directionChanged();
    void pauseChanged();

private Q_SLOTS:
    void contentMoved();
    void movementStarted();
    void movementEnded();

private:
    void setActive(bool active);
    qreal contentY() const;

    QPointer<QQuickItem> m_flickable;
    QPropertyAnimation m_animation;
    QTimer m_hideTimer;
    qreal m_startY = 0;
    qreal m_lastY = 0;
    bool m_active = false;
    int m_direction = Qt::UpArrow;
};
