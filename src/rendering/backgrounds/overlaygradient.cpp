#include "overlaygradient.h"

#include "core/theme.h"

#include <algorithm>

OverlayGradient::OverlayGradient(QQuickItem *parent)
    : QQuickItem(parent)
    , m_color(this, [] { return Pelkan::Theme::instance()->overlayBackgroundColor(); },
              [this] {
                  update();
                  Q_EMIT colorChanged();
              })
{
    setFlag(ItemHasContents);
}

void OverlayGradient::setDirection(DeclarativeOpacityRamp::Direction direction)
{
    if (direction == m_direction)
        return;
    m_direction = direction;
    update();
    Q_EMIT directionChanged();
}

void OverlayGradient::setOffset(qreal offset)
{
    if (qFuzzyCompare(offset, m_offset))
        return;
    m_offset = offset;
    update();
    Q_EMIT offsetChanged();
}

void OverlayGradient::setSlope(qreal slope)
{
    if (qFuzzyCompare(slope, m_slope))
        return;
    m_slope = slope;
    update();
    Q_EMIT slopeChanged();
}

void OverlayGradient::geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChanged(newGeometry, oldGeometry);
    if (newGeometry.size() != oldGeometry.size())
        update();
}

QVector<OverlayGradientNode::Stop> OverlayGradient::stops(qreal offset, qreal slope)
{
    QVector<qreal> at { 0, 1 };
    if (slope != 0) {
        // The opacity is linear between where it leaves 0 and where it reaches 1.
        for (qreal t : { offset, offset + 1 / slope }) {
            if (t > 0 && t < 1)
                at.append(t);
        }
    }
    std::sort(at.begin(), at.end());
    QVector<OverlayGradientNode::Stop> result;
    for (qreal t : qAsConst(at))
        result.append({ t, qBound<qreal>(0, slope * (t - offset), 1) });
    return result;
}

QSGNode *OverlayGradient::updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *)
{
    const QVector<OverlayGradientNode::Stop> ramp = stops(m_offset, m_slope);
    const bool clear = std::all_of(ramp.begin(), ramp.end(), [](const OverlayGradientNode::Stop &s) { return s.opacity <= 0; });
    if (width() <= 0 || height() <= 0 || clear || color().alpha() == 0) {
        delete oldNode;
        return nullptr;
    }
    auto node = static_cast<OverlayGradientNode *>(oldNode);
    if (!node)
        node = new OverlayGradientNode;
    // Reversed directions run the same ramp from the other end.
    QVector<OverlayGradientNode::Stop> placed = ramp;
    const bool reversed = m_direction == DeclarativeOpacityRamp::RightToLeft || m_direction == DeclarativeOpacityRamp::BottomToTop;
    if (reversed) {
        std::reverse(placed.begin(), placed.end());
        for (OverlayGradientNode::Stop &stop : placed)
            stop.position = 1 - stop.position;
    }
    const bool vertical = m_direction == DeclarativeOpacityRamp::TopToBottom || m_direction == DeclarativeOpacityRamp::BottomToTop;
    node->setGradient(boundingRect(), vertical, color(), placed);
    return node;
}
