#pragma once

#include "rendering/backgrounds/backgroundshapenode.h"
#include "rendering/common/themedcolor.h"

#include <QColor>
#include <QQuickItem>

// What the toolkit's drawn backgrounds share: a fill colour, a corner radius and a border,
// drawn by one BackgroundShapeNode. The colours follow the theme until they are set.
class BackgroundShapeItem : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(QColor color READ color WRITE setColor RESET resetColor NOTIFY colorChanged)
    Q_PROPERTY(qreal radius READ radius WRITE setRadius NOTIFY radiusChanged)
    Q_PROPERTY(qreal borderWidth READ borderWidth WRITE setBorderWidth NOTIFY borderWidthChanged)
    Q_PROPERTY(QColor borderColor READ borderColor WRITE setBorderColor RESET resetBorderColor NOTIFY borderColorChanged)

public:
    explicit BackgroundShapeItem(QQuickItem *parent = nullptr);

    QColor color() const { return m_color.value(); }
    void setColor(const QColor &color) { m_color.set(color); }
    void resetColor() { m_color.reset(); }
    qreal radius() const { return m_radius; }
    void setRadius(qreal radius);
    qreal borderWidth() const { return m_borderWidth; }
    void setBorderWidth(qreal width);
    QColor borderColor() const { return m_borderColor.value(); }
    void setBorderColor(const QColor &color) { m_borderColor.set(color); }
    void resetBorderColor() { m_borderColor.reset(); }

Q_SIGNALS:
    void colorChanged();
    void radiusChanged();
    void borderWidthChanged();
    void borderColorChanged();

protected:
    // The fill while no colour is set.
    virtual QColor themeColor() const = 0;
    // The outline in this item's coordinates; the base gives the item's rectangle.
    virtual BackgroundShape shape() const;
    // Anything besides the colours the subclass draws with.
    virtual void updateMaterial(BackgroundShapeMaterial *) {}

    QSGNode *updatePaintNode(QSGNode *node, UpdatePaintNodeData *) override;
    void geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry) override;

private:
    ThemedColor m_color;
    ThemedColor m_borderColor;
    qreal m_radius = 0;
    qreal m_borderWidth = 0;
};
