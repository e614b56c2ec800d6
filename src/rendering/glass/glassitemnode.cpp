#include "glassitemnode.h"
#include "rendering/glass/glassmaterial.h"
#include "core/pelkanlogging.h"

GlassItemNode::GlassItemNode(int angle)
    : m_geometry(QSGGeometry::defaultAttributes_TexturedPoint2D(), 4)
{
    setGeometry(&m_geometry);
    if (GlassMaterial::isValidAngle(angle)) {
        setMaterial(new GlassMaterial(angle));
        setFlag(OwnsMaterial);
    } else {
        qCWarning(lcPelkanCoreLog) << "GlassItemNode: invalid angle" << angle;
    }
}

GlassMaterial *GlassItemNode::glassMaterial() const
{
    return static_cast<GlassMaterial *>(material());
}

void GlassItemNode::setRect(const QRectF &rect)
{
    QSGGeometry::updateTexturedRectGeometry(&m_geometry, rect, QRectF(0, 0, 1, 1));
    markDirty(DirtyGeometry);
}
