#pragma once

#include <QPointF>
#include <QQuickItem>

// DragDetectorItem: watches the presses that reach its children without taking them, and
// says when one turns into a drag: past the platform start-drag distance, with the
// direction the finger went first (TouchInteraction.Left, Up, Right, Down) and how far it
// has gone since the press; and when the finger lifts or the press is taken away. A list
// item uses it to drop its press highlight as soon as a swipe over it begins.
class DragDetectorItem : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(bool pressed READ pressed NOTIFY pressedChanged)
    Q_PROPERTY(bool dragging READ dragging NOTIFY draggingChanged)
    Q_PROPERTY(int direction READ direction NOTIFY draggingChanged)
    Q_PROPERTY(QPointF distance READ distance NOTIFY distanceChanged)

public:
    explicit DragDetectorItem(QQuickItem *parent = nullptr);

    bool pressed() const { return m_pressed; }
    bool dragging() const { return m_dragging; }
    int direction() const { return m_direction; }
    QPointF distance() const { return m_distance; }

Q_SIGNALS:
    void pressedChanged();
    void draggingChanged();
    void distanceChanged();
    void dragStarted(int direction);
    void dragEnded();

protected:
    bool childMouseEventFilter(QQuickItem *item, QEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseUngrabEvent() override;

private:
    void press(const QPointF &scenePosition);
    void move(const QPointF &scenePosition);
    void end();

    QPointF m_pressPosition;
    QPointF m_distance;
    int m_direction = -1;
    bool m_pressed = false;
    bool m_dragging = false;
};
