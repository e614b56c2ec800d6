#pragma once

#include <QPointF>
#include <QPointer>
#include <QQmlListProperty>
#include <QQuickItem>

// InverseMouseArea: reports presses outside its own rectangle, anywhere in its window,
// without taking them from whatever is under the finger: a menu closes, an edit ends, and
// the button that was pressed still works. Items listed in insideItems (a menu's button,
// the keyboard's toolbar) count as inside. Positions are in the area's own coordinates.
// It watches the window only while enabled and visible.
class MInverseMouseArea : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(bool pressed READ pressed NOTIFY pressedChanged)
    Q_PROPERTY(QQmlListProperty<QQuickItem> insideItems READ insideItems)

public:
    explicit MInverseMouseArea(QQuickItem *parent = nullptr);
    ~MInverseMouseArea() override;

    bool pressed() const { return m_pressed; }
    QQmlListProperty<QQuickItem> insideItems();

    // Whether a point of the window (scene coordinates) counts as inside.
    bool isInside(const QPointF &scenePosition) const;

Q_SIGNALS:
    void pressedChanged();
    void pressedOutside(qreal x, qreal y);
    void clickedOutside(qreal x, qreal y);
    void canceledOutside();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;
    void itemChange(ItemChange change, const ItemChangeData &data) override;

private:
    void watch();
    void press(const QPointF &scenePosition);
    void release(const QPointF &scenePosition);
    void cancel();

    QPointer<QQuickWindow> m_watched;
    QList<QPointer<QQuickItem>> m_insideItems;
    QPointF m_pressPosition;
    int m_touchId = -1;
    bool m_pressed = false;
};
