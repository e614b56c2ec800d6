#include "backgroundshapenode.h"

#include <cmath>

namespace {

struct Vertex {
    float x, y;                    // position
    float lx, ly;                  // from the body's centre
    float halfWidth, halfHeight, radius, border;
    float ax, ay, bx, by;          // tail base
    float cx, cy, tx, ty;          // tail tip, backdrop coordinates
};

const QSGGeometry::AttributeSet &attributes()
{
    static const QSGGeometry::Attribute list[] = {
        QSGGeometry::Attribute::createWithAttributeType(0, 2, QSGGeometry::FloatType, QSGGeometry::PositionAttribute),
        QSGGeometry::Attribute::createWithAttributeType(1, 2, QSGGeometry::FloatType, QSGGeometry::UnknownAttribute),
        QSGGeometry::Attribute::createWithAttributeType(2, 4, QSGGeometry::FloatType, QSGGeometry::UnknownAttribute),
        QSGGeometry::Attribute::createWithAttributeType(3, 4, QSGGeometry::FloatType, QSGGeometry::UnknownAttribute),
        QSGGeometry::Attribute::createWithAttributeType(4, 4, QSGGeometry::FloatType, QSGGeometry::UnknownAttribute),
    };
    static const QSGGeometry::AttributeSet set = { 5, sizeof(Vertex), list };
    return set;
}

} // namespace

BackgroundShapeNode::BackgroundShapeNode()
    : m_geometry(attributes(), 4)
{
    m_geometry.setDrawingMode(QSGGeometry::DrawTriangleStrip);
    setGeometry(&m_geometry);
    setMaterial(&m_material);
}

void BackgroundShapeNode::setShape(const BackgroundShape &shape)
{
    const QPointF centre = shape.body.center();
    const bool tailed = std::abs((shape.tail[1].x() - shape.tail[0].x()) * (shape.tail[2].y() - shape.tail[0].y())
                                 - (shape.tail[2].x() - shape.tail[0].x()) * (shape.tail[1].y() - shape.tail[0].y())) > 0.5;
    if (tailed != m_material.isTailed()) {
        m_material.setTailed(tailed);
        markDirty(DirtyMaterial);
    }
    const QPointF a = shape.tail[0] - centre, b = shape.tail[1] - centre, c = shape.tail[2] - centre;
    const QPointF corners[4] = { shape.area.topLeft(), shape.area.topRight(), shape.area.bottomLeft(),
                                 shape.area.bottomRight() };
    auto *v = static_cast<Vertex *>(m_geometry.vertexData());
    for (int i = 0; i < 4; ++i) {
        const QPointF local = corners[i] - centre;
        v[i] = { float(corners[i].x()), float(corners[i].y()), float(local.x()), float(local.y()),
                 float(shape.body.width() / 2), float(shape.body.height() / 2), float(shape.radius), float(shape.border),
                 float(a.x()), float(a.y()), float(b.x()), float(b.y()),
                 float(c.x()), float(c.y()), float(shape.backdrop[i].x()), float(shape.backdrop[i].y()) };
    }
    markDirty(DirtyGeometry);
}
