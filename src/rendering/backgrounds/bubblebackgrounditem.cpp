#include "bubblebackgrounditem.h"

#include "core/theme.h"

#include <QtMath>

BubbleBackgroundItem::BubbleBackgroundItem(QQuickItem *parent)
    : BackgroundShapeItem(parent)
    , m_tailSize(Pelkan::Theme::instance()->paddingMedium())
{
}

QColor BubbleBackgroundItem::themeColor() const
{
    return Pelkan::Theme::instance()->rgba(Pelkan::Theme::instance()->highlightBackgroundColor(), 0.3);
}

template <typename T>
void BubbleBackgroundItem::assign(T &field, T value)
{
    if (field == value)
        return;
    field = value;
    update();
    Q_EMIT tailChanged();
}

void BubbleBackgroundItem::setTailEdge(Qt::Edge edge)
{
    if (edge != Qt::TopEdge && edge != Qt::BottomEdge && edge != Qt::LeftEdge && edge != Qt::RightEdge) {
        qWarning("BubbleBackground: tailEdge takes one edge, not %d", int(edge));
        return;
    }
    assign(m_tailEdge, edge);
}

void BubbleBackgroundItem::setTailOffset(qreal offset)
{
    assign(m_tailOffset, offset);
}

void BubbleBackgroundItem::setTailSize(qreal size)
{
    assign(m_tailSize, qMax<qreal>(0, size));
}

void BubbleBackgroundItem::setTailDirection(qreal degrees)
{
    assign(m_tailDirection, qBound<qreal>(-75, degrees, 75));
}

BackgroundShape BubbleBackgroundItem::shape() const
{
    BackgroundShape s = BackgroundShapeItem::shape();
    const bool horizontal = m_tailEdge == Qt::TopEdge || m_tailEdge == Qt::BottomEdge;
    const qreal across = horizontal ? height() : width();
    const qreal size = qMin(m_tailSize, across / 2);
    if (size <= 0)
        return s;
    QRectF &body = s.body;
    QPointF outward;
    switch (m_tailEdge) {
    case Qt::TopEdge:
        body.setTop(body.top() + size);
        outward = QPointF(0, -1);
        break;
    case Qt::BottomEdge:
        body.setBottom(body.bottom() - size);
        outward = QPointF(0, 1);
        break;
    case Qt::LeftEdge:
        body.setLeft(body.left() + size);
        outward = QPointF(-1, 0);
        break;
    default:
        body.setRight(body.right() - size);
        outward = QPointF(1, 0);
        break;
    }
    const QPointF along = horizontal ? QPointF(1, 0) : QPointF(0, 1);
    const qreal length = horizontal ? body.width() : body.height();
    // The base stays on the straight part of the edge.
    const qreal margin = qMin(s.radius, qMin(body.width(), body.height()) / 2) + size / 2;
    qreal at = m_tailOffset >= 0 ? m_tailOffset : length + m_tailOffset;
    at = margin < length - margin ? qBound(margin, at, length - margin) : length / 2;

    const QPointF start = horizontal ? QPointF(body.left(), m_tailEdge == Qt::TopEdge ? body.top() : body.bottom())
                                     : QPointF(m_tailEdge == Qt::LeftEdge ? body.left() : body.right(), body.top());
    const QPointF onEdge = start + along * at;
    // The base reaches a little into the body so that no seam shows where they meet.
    const QPointF base = onEdge - outward * qMax<qreal>(2, s.border + 1);
    const qreal angle = qDegreesToRadians(m_tailDirection);
    s.tail[0] = base - along * (size / 2);
    s.tail[1] = base + along * (size / 2);
    s.tail[2] = onEdge + (outward * std::cos(angle) + along * std::sin(angle)) * size;
    s.area = boundingRect().united(QRectF(s.tail[2], QSizeF(1, 1)).adjusted(-1, -1, 0, 0));
    return s;
}
