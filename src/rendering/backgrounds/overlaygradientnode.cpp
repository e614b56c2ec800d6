#include "overlaygradientnode.h"

OverlayGradientNode::OverlayGradientNode()
    : m_geometry(QSGGeometry::defaultAttributes_ColoredPoint2D(), 0)
{
    m_geometry.setDrawingMode(QSGGeometry::DrawTriangleStrip);
    setGeometry(&m_geometry);
    setMaterial(&m_material);
}

void OverlayGradientNode::setGradient(const QRectF &rect, bool vertical, const QColor &color, const QVector<Stop> &stops)
{
    m_geometry.allocate(2 * stops.size());
    auto *v = m_geometry.vertexDataAsColoredPoint2D();
    for (const Stop &stop : stops) {
        // Premultiplied, as the material expects.
        const qreal a = color.alphaF() * stop.opacity;
        const uchar r = uchar(qRound(color.redF() * a * 255)), g = uchar(qRound(color.greenF() * a * 255)),
                    b = uchar(qRound(color.blueF() * a * 255)), alpha = uchar(qRound(a * 255));
        const QPointF p1 = vertical ? QPointF(rect.left(), rect.top() + stop.position * rect.height())
                                    : QPointF(rect.left() + stop.position * rect.width(), rect.top());
        const QPointF p2 = vertical ? QPointF(rect.right(), p1.y()) : QPointF(p1.x(), rect.bottom());
        (v++)->set(float(p1.x()), float(p1.y()), r, g, b, alpha);
        (v++)->set(float(p2.x()), float(p2.y()), r, g, b, alpha);
    }
    markDirty(DirtyGeometry);
}
