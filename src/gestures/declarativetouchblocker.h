#pragma once

#include <QQuickItem>

// TouchBlocker: swallows every mouse, touch and wheel event over its area while it is
// enabled, so that nothing below reacts (the page stack lays one over its pages while they
// move). Disabled, or invisible, it lets everything through, as any disabled item does.
class DeclarativeTouchBlocker : public QQuickItem
{
    Q_OBJECT

public:
    explicit DeclarativeTouchBlocker(QQuickItem *parent = nullptr);

protected:
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void mouseDoubleClickEvent(QMouseEvent *event) override;
    void touchEvent(QTouchEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;
    void hoverEnterEvent(QHoverEvent *event) override;
    void hoverMoveEvent(QHoverEvent *event) override;
};
