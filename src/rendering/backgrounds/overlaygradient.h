#pragma once

#include "enums/declarativeopacityramp.h"
#include "rendering/backgrounds/overlaygradientnode.h"
#include "rendering/common/themedcolor.h"

#include <QColor>
#include <QQuickItem>

// OverlayGradientBase: `color` laid over its area with an opacity that ramps along
// `direction` (an OpacityRamp direction; the ramp's position t runs 0 to 1 that way):
// opacity = clamp(slope * (t - offset), 0, 1). So with offset 0.5 and slope 2 the first
// half is clear and the second fades in to the full colour; a negative slope fades out.
// Used over the edges of views to fade their content into the background. The colour is
// the theme's overlay colour until set.
class OverlayGradient : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(QColor color READ color WRITE setColor RESET resetColor NOTIFY colorChanged)
    Q_PROPERTY(DeclarativeOpacityRamp::Direction direction READ direction WRITE setDirection NOTIFY directionChanged)
    Q_PROPERTY(qreal offset READ offset WRITE setOffset NOTIFY offsetChanged)
    Q_PROPERTY(qreal slope READ slope WRITE setSlope NOTIFY slopeChanged)

public:
    explicit OverlayGradient(QQuickItem *parent = nullptr);

    QColor color() const { return m_color.value(); }
    void setColor(const QColor &color) { m_color.set(color); }
    void resetColor() { m_color.reset(); }
    DeclarativeOpacityRamp::Direction direction() const { return m_direction; }
    void setDirection(DeclarativeOpacityRamp::Direction direction);
    qreal offset() const { return m_offset; }
    void setOffset(qreal offset);
    qreal slope() const { return m_slope; }
    void setSlope(qreal slope);

    // The ramp's stops from t = 0 to t = 1: the ends and wherever the opacity starts or
    // stops changing in between.
    static QVector<OverlayGradientNode::Stop> stops(qreal offset, qreal slope);

Q_SIGNALS:
    void colorChanged();
    void directionChanged();
    void offsetChanged();
    void slopeChanged();

protected:
    QSGNode *updatePaintNode(QSGNode *node, UpdatePaintNodeData *) override;
    void geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry) override;

private:
    ThemedColor m_color;
    DeclarativeOpacityRamp::Direction m_direction = DeclarativeOpacityRamp::LeftToRight;
    qreal m_offset = 0;
    qreal m_slope = 1;
};
