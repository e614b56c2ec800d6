#pragma once

#include "rendering/backgrounds/backgroundshapeitem.h"

// BubbleBackground: a speech bubble for chat-like layouts: a rounded, bordered body and a
// tail in one draw call. The tail sits on `tailEdge`, its base centred `tailOffset` pixels
// from the edge's start (left or top; negative: from its end), kept clear of the corners;
// it is `tailSize` long and as wide at its base, leaning `tailDirection` degrees from
// straight out (towards the edge's end for positive angles). The body leaves the tail's
// length free on that edge, so the tail stays inside the item. The fill is the theme's
// highlight background at 0.3 until set; bubbles of equal colours batch.
class BubbleBackgroundItem : public BackgroundShapeItem
{
    Q_OBJECT
    Q_PROPERTY(Qt::Edge tailEdge READ tailEdge WRITE setTailEdge NOTIFY tailChanged)
    Q_PROPERTY(qreal tailOffset READ tailOffset WRITE setTailOffset NOTIFY tailChanged)
    Q_PROPERTY(qreal tailSize READ tailSize WRITE setTailSize NOTIFY tailChanged)
    Q_PROPERTY(qreal tailDirection READ tailDirection WRITE setTailDirection NOTIFY tailChanged)

public:
    explicit BubbleBackgroundItem(QQuickItem *parent = nullptr);

    Qt::Edge tailEdge() const { return m_tailEdge; }
    void setTailEdge(Qt::Edge edge);
    qreal tailOffset() const { return m_tailOffset; }
    void setTailOffset(qreal offset);
    qreal tailSize() const { return m_tailSize; }
    void setTailSize(qreal size);
    qreal tailDirection() const { return m_tailDirection; }
    void setTailDirection(qreal degrees);

    // The body and the tail (base corners, then the tip) in this item's coordinates.
    BackgroundShape shape() const override;

Q_SIGNALS:
    void tailChanged();

protected:
    QColor themeColor() const override;

private:
    template <typename T>
    void assign(T &field, T value);

    Qt::Edge m_tailEdge = Qt::BottomEdge;
    qreal m_tailOffset = 0;
    qreal m_tailSize;
    qreal m_tailDirection = 0;
};
