#pragma once

#include <QColor>
#include <QSGGeometryNode>
#include <QSGVertexColorMaterial>
#include <QVector>

// A rectangle whose colour's opacity ramps along one axis through a few stops, drawn as a
// strip of vertex-coloured quads: no texture, no per-pixel work beyond the interpolation,
// and it batches with every other vertex-coloured node.
class OverlayGradientNode : public QSGGeometryNode
{
public:
    struct Stop {
        qreal position; // 0..1 along the ramp
        qreal opacity;  // 0..1
    };

    OverlayGradientNode();

    // vertical: the ramp runs from the top (position 0) to the bottom; otherwise from the left.
    void setGradient(const QRectF &rect, bool vertical, const QColor &color, const QVector<Stop> &stops);

private:
    QSGVertexColorMaterial m_material;
    QSGGeometry m_geometry;
};
