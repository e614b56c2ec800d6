#pragma once

#include "rendering/backgrounds/backgroundshapeitem.h"

#include <QPointer>
#include <QUrl>
#include <private/qquickpixmapcache_p.h>


// GlassBackgroundBase: a rounded, bordered panel of translucent glass in one draw call.
// The fill (the theme's overlay colour, 0.6 opaque, until set) lies over an optional
// `backdrop`: a texture provider such as an OverlayBackgroundSource or a BlurEffect, whose
// texture shows its `sourceItem` (or itself), and of which the panel shows the part behind
// it, following as either moves. The theme's glass `pattern` brightens the fill by
// `patternOpacity`. Dialogs, menus and covers complete it in QML.
//     GlassBackgroundBase { anchors.fill: parent; radius: Theme.paddingMedium; backdrop: overlaySource }
class GlassBackground : public BackgroundShapeItem
{
    Q_OBJECT
    Q_PROPERTY(QQuickItem *backdrop READ backdrop WRITE setBackdrop NOTIFY backdropChanged)
    Q_PROPERTY(QUrl pattern READ pattern WRITE setPattern NOTIFY patternChanged)
    Q_PROPERTY(qreal patternOpacity READ patternOpacity WRITE setPatternOpacity NOTIFY patternOpacityChanged)

public:
    explicit GlassBackground(QQuickItem *parent = nullptr);
    ~GlassBackground() override;

    QQuickItem *backdrop() const { return m_backdrop; }
    void setBackdrop(QQuickItem *backdrop);
    QUrl pattern() const { return m_patternUrl; }
    void setPattern(const QUrl &pattern);
    qreal patternOpacity() const { return m_patternOpacity; }
    void setPatternOpacity(qreal opacity);

    // Where this item's corners fall in what the backdrop shows (0..1 across it): top
    // left, top right, bottom left, bottom right. Empty without a usable backdrop.
    QVector<QPointF> backdropCorners() const;

Q_SIGNALS:
    void backdropChanged();
    void patternChanged();
    void patternOpacityChanged();

protected:
    QColor themeColor() const override;
    BackgroundShape shape() const override;
    void updateMaterial(BackgroundShapeMaterial *material) override;
    void componentComplete() override;
    void itemChange(ItemChange change, const ItemChangeData &data) override;

private Q_SLOTS:
    void patternLoaded();

private:
    QQuickItem *capturedItem() const;
    void followBackdrop();
    void useSource(bool use);
    void loadPattern();
    void checkMoved();

    QPointer<QQuickItem> m_backdrop;
    QPointer<QQuickItem> m_usedSource; // a SharedBackdrop this panel has told it uses it
    QMetaObject::Connection m_frames;
    QVector<QPointF> m_lastCorners;
    QUrl m_patternUrl = QUrl(QStringLiteral("image://theme/graphic-shader-texture"));
    QQuickPixmap m_pattern;
    qreal m_patternOpacity = 0.1;
    mutable bool m_warnedInside = false;
};
