#include "declarativeunderline.h"
#include "core/theme.h"

#include <QQuickWindow>
#include <QSGRectangleNode>

#include <cmath>

DeclarativeUnderline::DeclarativeUnderline(QQuickItem *parent)
    : QQuickItem(parent)
    , m_errorColor(this, [] { return Pelkan::Theme::instance()->errorColor(); }, [this] {
        Q_EMIT errorColorChanged();
        update();
    })
{
    setFlag(ItemHasContents);
}

namespace {

template <typename T, typename Signal>
void assign(DeclarativeUnderline *item, T &member, const T &value, Signal changed)
{
    if (member == value)
        return;
    member = value;
    Q_EMIT (item->*changed)();
    item->update();
}

} // namespace

void DeclarativeUnderline::setColor(const QColor &color) { assign(this, m_color, color, &DeclarativeUnderline::colorChanged); }
void DeclarativeUnderline::setHighlightColor(const QColor &color) { assign(this, m_highlightColor, color, &DeclarativeUnderline::highlightColorChanged); }
void DeclarativeUnderline::setErrorColor(const QColor &color) { m_errorColor.set(color); }
void DeclarativeUnderline::resetErrorColor() { m_errorColor.reset(); }
void DeclarativeUnderline::setHighlighted(bool highlighted) { assign(this, m_highlighted, highlighted, &DeclarativeUnderline::highlightedChanged); }
void DeclarativeUnderline::setErrorHighlight(bool error) { assign(this, m_errorHighlight, error, &DeclarativeUnderline::errorHighlightChanged); }
void DeclarativeUnderline::setLineWidth(qreal width) { assign(this, m_lineWidth, qMax<qreal>(0, width), &DeclarativeUnderline::lineWidthChanged); }
void DeclarativeUnderline::setFocusLineWidth(qreal width) { assign(this, m_focusLineWidth, qMax<qreal>(0, width), &DeclarativeUnderline::focusLineWidthChanged); }

QRectF DeclarativeUnderline::lineRect(qreal devicePixelRatio, const QPointF &scenePosition) const
{
    const qreal dpr = devicePixelRatio > 0 ? devicePixelRatio : 1;
    const qreal wanted = m_highlighted ? m_focusLineWidth : m_lineWidth;
    const qreal thickness = qMax<qreal>(1, std::round(wanted * dpr)) / dpr;
    // The bottom edge in scene pixels, rounded; the item-local offset that puts it there.
    const qreal sceneBottom = std::round((scenePosition.y() + height()) * dpr) / dpr;
    const qreal sceneLeft = std::round(scenePosition.x() * dpr) / dpr;
    const qreal sceneRight = std::round((scenePosition.x() + width()) * dpr) / dpr;
    return QRectF(sceneLeft - scenePosition.x(), sceneBottom - scenePosition.y() - thickness,
                  sceneRight - sceneLeft, thickness);
}

QSGNode *DeclarativeUnderline::updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *)
{
    auto *node = static_cast<QSGRectangleNode *>(oldNode);
    const qreal wanted = m_highlighted ? m_focusLineWidth : m_lineWidth;
    if (width() <= 0 || wanted <= 0) {
        delete node;
        return nullptr;
    }
    if (!node)
        node = window()->createRectangleNode();
    node->setRect(lineRect(window()->effectiveDevicePixelRatio(), mapToScene(QPointF(0, 0))));
    node->setColor(m_errorHighlight ? m_errorColor.value() : m_highlighted ? m_highlightColor : m_color);
    return node;
}

void DeclarativeUnderline::geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChanged(newGeometry, oldGeometry);
    update();
}
