#pragma once

#include <QColor>
#include <QObject>
#include <QPointer>
#include <QtQml>

class GlassBackground;
class OverlayBackgroundSource;
class QQuickItem;

// OverlayBackground (attached): an overlay opts in with `OverlayBackground.enabled: true`
// and is backed by frosted glass: a GlassBackgroundBase under its children, filling it,
// showing the blurred capture of an OverlayBackgroundSource (the window's first, unless
// `source` names one) tinted by `color` and rounded by `radius`. Any number of overlays
// share one capture.
//     Rectangle { color: "transparent"; OverlayBackground.enabled: true; OverlayBackground.radius: 8 }
class OverlayBackground : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool enabled READ isEnabled WRITE setEnabled NOTIFY enabledChanged)
    Q_PROPERTY(OverlayBackgroundSource *source READ source WRITE setSource RESET resetSource NOTIFY sourceChanged)
    Q_PROPERTY(QColor color READ color WRITE setColor RESET resetColor NOTIFY colorChanged)
    Q_PROPERTY(qreal radius READ radius WRITE setRadius NOTIFY radiusChanged)
    Q_PROPERTY(QQuickItem *background READ background NOTIFY backgroundChanged)

public:
    explicit OverlayBackground(QObject *parent = nullptr);
    ~OverlayBackground() override;

    static OverlayBackground *qmlAttachedProperties(QObject *object);

    bool isEnabled() const { return m_enabled; }
    void setEnabled(bool enabled);
    OverlayBackgroundSource *source() const;
    void setSource(OverlayBackgroundSource *source);
    void resetSource();
    QColor color() const;
    void setColor(const QColor &color);
    void resetColor();
    qreal radius() const { return m_radius; }
    void setRadius(qreal radius);
    // The glass drawn under the overlay while enabled.
    QQuickItem *background() const;

Q_SIGNALS:
    void enabledChanged();
    void sourceChanged();
    void colorChanged();
    void radiusChanged();
    void backgroundChanged();

private:
    void rebuild();
    void apply();

    QPointer<QQuickItem> m_item;
    QPointer<GlassBackground> m_background;
    QPointer<OverlayBackgroundSource> m_source;
    bool m_sourceSet = false;
    bool m_enabled = false;
    QColor m_color;
    bool m_colorSet = false;
    qreal m_radius = 0;
};

QML_DECLARE_TYPEINFO(OverlayBackground, QML_HAS_ATTACHED_PROPERTIES)
