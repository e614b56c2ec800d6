#pragma once

#include "core/item.h"

#include <QColor>
#include <QPointer>
#include <QUrl>
#include <private/qquickpixmapcache_p.h>

class DeclarativeWindow;

// A rectangle-filling glass glow: a soft falloff around the centre, a soft disc edge, a
// screen-anchored pattern and, optionally, dashes running along the item as the user
// sees it (the material follows the display rotation). ratio 0 stretches the glow along
// the longer side. backgroundColor announces itself through colorChanged(), and dash
// lengths only redraw while dashed, as the toolkit's components expect.
class DeclarativeGlassItem : public Pelkan::Item
{
    Q_OBJECT
    Q_PROPERTY(QColor color READ color WRITE setColor NOTIFY colorChanged)
    Q_PROPERTY(QColor backgroundColor READ backgroundColor WRITE setBackgroundColor NOTIFY backgroundColorChanged)
    Q_PROPERTY(QUrl pattern READ pattern WRITE setPattern NOTIFY patternChanged)
    Q_PROPERTY(bool dimmed READ dimmed WRITE setDimmed NOTIFY dimmedChanged)
    Q_PROPERTY(bool cache READ cache WRITE setCache NOTIFY cacheChanged)
    Q_PROPERTY(float radius READ radius WRITE setRadius RESET resetRadius NOTIFY radiusChanged)
    Q_PROPERTY(float falloffRadius READ falloffRadius WRITE setFalloffRadius RESET resetFalloffRadius NOTIFY falloffRadiusChanged)
    Q_PROPERTY(float defaultFalloffRadius READ defaultFalloffRadius CONSTANT)
    Q_PROPERTY(float ratio READ ratio WRITE setRatio NOTIFY ratioChanged)
    Q_PROPERTY(bool dashed READ dashed WRITE setDashed NOTIFY dashedChanged)
    Q_PROPERTY(float dashOffset READ dashOffset WRITE setDashOffset NOTIFY dashOffsetChanged)
    Q_PROPERTY(float dashLength READ dashLength WRITE setDashLength NOTIFY dashLengthChanged)
    Q_PROPERTY(float dashMargin READ dashMargin WRITE setDashMargin NOTIFY dashMarginChanged)
    Q_PROPERTY(float brightness READ brightness WRITE setBrightness NOTIFY brightnessChanged)

public:
    static constexpr float DefaultRadius = 0.15f;

    explicit DeclarativeGlassItem(QQuickItem *parent = nullptr);

    QColor color() const { return m_color; }
    void setColor(const QColor &color);
    QColor backgroundColor() const { return m_backgroundColor; }
    void setBackgroundColor(const QColor &color);
    QUrl pattern() const { return m_patternUrl; }
    void setPattern(const QUrl &pattern);
    bool dimmed() const { return m_dimmed; }
    void setDimmed(bool dimmed);
    bool cache() const { return m_cache; }
    void setCache(bool cache);
    float radius() const { return m_radius; }
    void setRadius(float radius);
    void resetRadius() { setRadius(DefaultRadius); }
    float falloffRadius() const { return m_falloffRadius; }
    void setFalloffRadius(float radius);
    void resetFalloffRadius() { setFalloffRadius(DefaultRadius); }
    float defaultFalloffRadius() const { return DefaultRadius; }
    float ratio() const { return m_ratio; }
    void setRatio(float ratio);
    bool dashed() const { return m_dashed; }
    void setDashed(bool dashed);
    float dashOffset() const { return m_dashOffset; }
    void setDashOffset(float offset);
    float dashLength() const { return m_dashLength; }
    void setDashLength(float length);
    float dashMargin() const { return m_dashMargin; }
    void setDashMargin(float margin);
    float brightness() const { return m_brightness; }
    void setBrightness(float brightness);

    int angle() const { return m_angle; }

    Q_INVOKABLE void angleChanged();
    Q_INVOKABLE void setDirty();

Q_SIGNALS:
    void colorChanged();
    void backgroundColorChanged();
    void patternChanged();
    void cacheChanged();
    void dimmedChanged();
    void radiusChanged();
    void falloffRadiusChanged();
    void ratioChanged();
    void dashedChanged();
    void dashOffsetChanged();
    void dashLengthChanged();
    void dashMarginChanged();
    void brightnessChanged();

protected:
    QSGNode *updatePaintNode(QSGNode *node, UpdatePaintNodeData *) override;
    void itemChange(ItemChange change, const ItemChangeData &data) override;
    void geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry) override;
    void componentComplete() override;

private:
    template <typename T>
    bool assign(T &field, const T &value);
    void loadPattern();
    int computeAngle() const;

    QColor m_color = Qt::white;
    QColor m_backgroundColor = Qt::transparent;
    QUrl m_patternUrl = QUrl(QStringLiteral("image://theme/graphic-shader-texture"));
    QQuickPixmap m_pattern;
    QPointer<DeclarativeWindow> m_window;
    bool m_dimmed = false;
    bool m_cache = false;
    float m_radius = DefaultRadius;
    float m_falloffRadius = DefaultRadius;
    float m_ratio = 1.0f;
    bool m_dashed = false;
    float m_dashOffset = 0;
    float m_dashLength = 35;
    float m_dashMargin = 15;
    float m_brightness = 1.0f;
    float m_dashSize = 8.0f;
    int m_angle = 0;
    bool m_materialDirty = true;
    bool m_geometryDirty = true;
    bool m_recreateNode = false;
};
