#pragma once

#include "rendering/common/themedcolor.h"

#include <QColor>
#include <QQuickItem>

// Underline: the line under a text field, drawn along the item's bottom edge and snapped
// to whole device pixels so it stays crisp at any position and pixel ratio: `lineWidth`
// thick in `color`, or `focusLineWidth` thick in `highlightColor` while `highlighted`
// (a focused field), or in `errorColor` while `errorHighlight` (input that does not
// validate; it wins over the focus colour). The error colour is the theme's until set,
// and again after a reset.
class DeclarativeUnderline : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(QColor color READ color WRITE setColor NOTIFY colorChanged)
    Q_PROPERTY(QColor highlightColor READ highlightColor WRITE setHighlightColor NOTIFY highlightColorChanged)
    Q_PROPERTY(QColor errorColor READ errorColor WRITE setErrorColor RESET resetErrorColor NOTIFY errorColorChanged)
    Q_PROPERTY(bool highlighted READ highlighted WRITE setHighlighted NOTIFY highlightedChanged)
    Q_PROPERTY(bool errorHighlight READ errorHighlight WRITE setErrorHighlight NOTIFY errorHighlightChanged)
    Q_PROPERTY(qreal lineWidth READ lineWidth WRITE setLineWidth NOTIFY lineWidthChanged)
    Q_PROPERTY(qreal focusLineWidth READ focusLineWidth WRITE setFocusLineWidth NOTIFY focusLineWidthChanged)

public:
    explicit DeclarativeUnderline(QQuickItem *parent = nullptr);

    QColor color() const { return m_color; }
    void setColor(const QColor &color);
    QColor highlightColor() const { return m_highlightColor; }
    void setHighlightColor(const QColor &color);
    QColor errorColor() const { return m_errorColor.value(); }
    void setErrorColor(const QColor &color);
    void resetErrorColor();
    bool highlighted() const { return m_highlighted; }
    void setHighlighted(bool highlighted);
    bool errorHighlight() const { return m_errorHighlight; }
    void setErrorHighlight(bool error);
    qreal lineWidth() const { return m_lineWidth; }
    void setLineWidth(qreal width);
    qreal focusLineWidth() const { return m_focusLineWidth; }
    void setFocusLineWidth(qreal width);

    // The drawn rectangle in item coordinates, for a device pixel ratio and the item's
    // scene position: whole device pixels, at least one thick, its bottom on the edge.
    QRectF lineRect(qreal devicePixelRatio, const QPointF &scenePosition) const;

Q_SIGNALS:
    void colorChanged();
    void highlightColorChanged();
    void errorColorChanged();
    void highlightedChanged();
    void errorHighlightChanged();
    void lineWidthChanged();
    void focusLineWidthChanged();

protected:
    QSGNode *updatePaintNode(QSGNode *node, UpdatePaintNodeData *data) override;
    void geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry) override;

private:
    QColor m_color { Qt::gray };
    QColor m_highlightColor { Qt::white };
    ThemedColor m_errorColor;
    qreal m_lineWidth = 1;
    qreal m_focusLineWidth = 2;
    bool m_highlighted = false;
    bool m_errorHighlight = false;
};
