#pragma once

#include "rendering/common/themedcolor.h"

#include <QColor>
#include <QPointer>
#include <QQuickItem>
#include <QVariantList>
#include <QVector>

// DimmedRegion: dims its whole area except its `holes` (items, which it follows as they
// move, or rectangles in its own coordinates), rounded by `radius`. The dimming is drawn as
// one set of triangles that never covers a hole, so nothing under a hole is drawn over
// twice. `color` follows the theme's overlay colour until set. Holes should not overlap.
//     DimmedRegion { anchors.fill: parent; holes: [sendButton]; radius: Theme.paddingMedium }
class DeclarativeDimmedRegion : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(QColor color READ color WRITE setColor RESET resetColor NOTIFY colorChanged)
    Q_PROPERTY(QVariantList holes READ holes WRITE setHoles NOTIFY holesChanged)
    Q_PROPERTY(qreal radius READ radius WRITE setRadius NOTIFY radiusChanged)

public:
    explicit DeclarativeDimmedRegion(QQuickItem *parent = nullptr);

    QColor color() const { return m_color.value(); }
    void setColor(const QColor &color) { m_color.set(color); }
    void resetColor() { m_color.reset(); }
    QVariantList holes() const { return m_holes; }
    void setHoles(const QVariantList &holes);
    qreal radius() const { return m_radius; }
    void setRadius(qreal radius);

    // The hole rectangles in this item's coordinates, clipped to it.
    QVector<QRectF> holeRects() const;
    // Triangles (three points each) covering the item less the holes.
    static QVector<QPointF> triangles(const QRectF &area, const QVector<QRectF> &holes, qreal radius);

Q_SIGNALS:
    void colorChanged();
    void holesChanged();
    void radiusChanged();

protected:
    QSGNode *updatePaintNode(QSGNode *node, UpdatePaintNodeData *data) override;
    void geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry) override;

private:
    QVariantList m_holes;
    QVector<QPointer<QQuickItem>> m_watched;
    ThemedColor m_color;
    qreal m_radius = 0;
};
