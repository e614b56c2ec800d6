#pragma once

#include "rendering/backgrounds/backgroundshapematerial.h"

#include <QPointF>
#include <QRectF>
#include <QSGGeometryNode>

// The outline of a background shape, in its item's coordinates.
struct BackgroundShape {
    QRectF body;         // the rounded rectangle
    qreal radius = 0;
    qreal border = 0;
    QPointF tail[3];     // two base corners and the tip; all equal for no tail
    QRectF area;         // what the quad covers (the body and the tail)
    QPointF backdrop[4]; // the area's corners in the backdrop (0..1 across it): top left, top right, bottom left, bottom right
};

// One quad drawing a BackgroundShape with a BackgroundShapeMaterial.
class BackgroundShapeNode : public QSGGeometryNode
{
public:
    BackgroundShapeNode();

    void setShape(const BackgroundShape &shape);
    BackgroundShapeMaterial *shapeMaterial() { return &m_material; }

private:
    BackgroundShapeMaterial m_material;
    QSGGeometry m_geometry;
};
