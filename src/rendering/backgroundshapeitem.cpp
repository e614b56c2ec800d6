#include "backgroundshapeitem.h"

#include "theme.h"

BackgroundShapeItem::BackgroundShapeItem(QQuickItem *parent)
    : QQuickItem(parent)
{
    setFlag(ItemHasContents);
    // A subclass's theme colour may come from any role: redraw on each.
    Pelkan::Theme *theme = Pelkan::Theme::instance();
    const auto themeChanged = [this] {
        if (!m_colorSet)
            Q_EMIT colorChanged();
        if (!m_borderColorSet)
            Q_EMIT borderColorChanged();
        update();
    };
    connect(theme, &Pelkan::Theme::primaryColorChanged, this, themeChanged);
    connect(theme, &Pelkan::Theme::highlightBackgroundColorChanged, this, themeChanged);
    connect(theme, &Pelkan::Theme::overlayBackgroundColorChanged, this, themeChanged);
}

void BackgroundShapeItem::setColor(const QColor &color)
{
    if (m_colorSet && color == m_color)
        return;
    m_color = color;
    m_colorSet = true;
    update();
    Q_EMIT colorChanged();
}

void BackgroundShapeItem::resetColor()
{
    if (!std::exchange(m_colorSet, false))
        return;
    update();
    Q_EMIT colorChanged();
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

QColor BackgroundShapeItem::borderColor() const
{
    if (m_borderColorSet)
        return m_borderColor;
    return Pelkan::Theme::instance()->rgba(Pelkan::Theme::instance()->primaryColor(), 0.2);
}

void BackgroundShapeItem::setBorderColor(const QColor &color)
{
    if (m_borderColorSet && color == m_borderColor)
        return;
    m_borderColor = color;
    m_borderColorSet = true;
    update();
    Q_EMIT borderColorChanged();
}

void BackgroundShapeItem::resetBorderColor()
{
    if (!std::exchange(m_borderColorSet, false))
        return;
    update();
    Q_EMIT borderColorChanged();
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
