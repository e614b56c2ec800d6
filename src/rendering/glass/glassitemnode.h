#pragma once

#include <QSGGeometryNode>

class GlassMaterial;

// A rectangle of textured 2D points drawn with the glass material of one rotation.
class GlassItemNode : public QSGGeometryNode
{
public:
    // An angle other than 0, 90, 180 or 270 leaves the node without a material.
    explicit GlassItemNode(int angle);

    GlassMaterial *glassMaterial() const;
    void setRect(const QRectF &rect);

private:
    QSGGeometry m_geometry;
};
