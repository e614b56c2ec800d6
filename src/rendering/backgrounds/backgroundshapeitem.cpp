#include "backgroundshapeitem.h"

#include "core/theme.h"

BackgroundShapeItem::BackgroundShapeItem(QQuickItem *parent)
    : QQuickItem(parent)
    , m_color(this, [this] { return themeColor(); },
              [this] {
                  update();
                  Q_EMIT colorChanged();
              })
    , m_borderColor(this, [] { return Pelkan::Theme::instance()->rgba(Pelkan::Theme::instance()->primaryColor(), 0.2); },
                    [this] {
                        update();
                        Q_EMIT borderColorChanged();
                    })
{
    setFlag(ItemHasContents);
}

void BackgroundShapeItem::setRadius(qreal radius)
{
    radius = qMax<qreal>(0, radius);
    if (qFuzzyCompare(radius, m_radius))
        return;
    m_radius = radius;
    update();
    Q_EMIT radiusChanged();
}

void BackgroundShapeItem::setBorderWidth(qreal width)
{
    width = qMax<qreal>(0, width);
    if (qFuzzyCompare(width, m_borderWidth))
        return;
    m_borderWidth = width;
    update();
    Q_EMIT borderWidthChanged();
}

BackgroundShape BackgroundShapeItem::shape() const
{
    BackgroundShape s;
    s.body = boundingRect();
    s.area = s.body;
    s.radius = m_radius;
    s.border = m_borderWidth;
    s.tail[0] = s.tail[1] = s.tail[2] = s.body.center();
    return s;
}

void BackgroundShapeItem::geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChanged(newGeometry, oldGeometry);
    if (newGeometry.size() != oldGeometry.size())
        update();
}

QSGNode *BackgroundShapeItem::updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *)
{
    if (width() <= 0 || height() <= 0) {
        delete oldNode;
        return nullptr;
    }
    auto node = static_cast<BackgroundShapeNode *>(oldNode);
    if (!node)
        node = new BackgroundShapeNode;
    BackgroundShapeMaterial *material = node->shapeMaterial();
    material->color = color();
    material->borderColor = m_borderWidth > 0 ? borderColor() : QColor(Qt::transparent);
    updateMaterial(material);
    node->setShape(shape());
    node->markDirty(QSGNode::DirtyMaterial);
    return node;
}
