#include "buttonlayout.h"

#include <QQmlEngine>
#include <QVector>

#include <algorithm>

ButtonLayout::ButtonLayout(QQuickItem *parent)
    : QQuickItem(parent)
{
}

void ButtonLayout::setRowSpacing(qreal spacing)
{
    if (spacing == m_rowSpacing)
        return;
    m_rowSpacing = spacing;
    Q_EMIT rowSpacingChanged();
    polish();
}

void ButtonLayout::setColumnSpacing(qreal spacing)
{
    if (spacing == m_columnSpacing)
        return;
    m_columnSpacing = spacing;
    Q_EMIT columnSpacingChanged();
    polish();
}

void ButtonLayout::setPreferredWidth(qreal width)
{
    if (width == m_preferredWidth)
        return;
    m_preferredWidth = width;
    Q_EMIT preferredWidthChanged();
    polish();
}

ButtonLayoutAttached *ButtonLayout::qmlAttachedProperties(QObject *object)
{
    auto *attached = new ButtonLayoutAttached(object);
    // A layout that already holds the button lays out again when it changes its mind.
    if (auto *item = qobject_cast<QQuickItem *>(object)) {
        QObject::connect(attached, &ButtonLayoutAttached::newLineChanged, item, [item] {
            if (auto *layout = qobject_cast<ButtonLayout *>(item->parentItem()))
                layout->polish();
        });
    }
    return attached;
}

void ButtonLayout::itemChange(ItemChange change, const ItemChangeData &data)
{
    if (change == ItemChildAddedChange) {
        watch(data.item);
        polish();
    } else if (change == ItemChildRemovedChange) {
        unwatch(data.item);
        polish();
    }
    QQuickItem::itemChange(change, data);
}

void ButtonLayout::geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChanged(newGeometry, oldGeometry);
    if (newGeometry.width() != oldGeometry.width())
        polish();
}

void ButtonLayout::componentComplete()
{
    QQuickItem::componentComplete();
    polish();
}

void ButtonLayout::watch(QQuickItem *child)
{
    const auto relayout = [this] {
        if (!m_laying)
            polish();
    };
    connect(child, &QQuickItem::visibleChanged, this, relayout);
    connect(child, &QQuickItem::implicitWidthChanged, this, relayout);
    connect(child, &QQuickItem::implicitHeightChanged, this, relayout);
}

void ButtonLayout::unwatch(QQuickItem *child)
{
    disconnect(child, nullptr, this, nullptr);
}

void ButtonLayout::updatePolish()
{
    m_laying = true;
    const qreal available = width();
    QVector<QQuickItem *> row;
    qreal rowWidth = 0; // the common button width of the row being filled
    qreal y = 0;
    int rows = 0;

    const auto place = [&] {
        if (row.isEmpty())
            return;
        const int n = row.size();
        const qreal buttonWidth = rowWidth;
        const qreal used = n * buttonWidth + (n - 1) * m_columnSpacing;
        qreal x = std::max<qreal>(0, (available - used) / 2);
        qreal rowHeight = 0;
        for (QQuickItem *button : qAsConst(row)) {
            button->setPosition(QPointF(x, y));
            button->setWidth(buttonWidth);
            x += buttonWidth + m_columnSpacing;
            rowHeight = std::max(rowHeight, button->height());
        }
        y += rowHeight + m_rowSpacing;
        ++rows;
        row.clear();
        rowWidth = 0;
    };

    const QList<QQuickItem *> children = childItems();
    for (QQuickItem *child : children) {
        if (!child->isVisible())
            continue;
        const auto *attached = qobject_cast<ButtonLayoutAttached *>(qmlAttachedPropertiesObject<ButtonLayout>(child, false));
        const qreal wanted = std::max(child->implicitWidth(), m_preferredWidth);
        const qreal widthIfAdded = std::max(rowWidth, wanted);
        const int n = row.size() + 1;
        const bool fits = n * widthIfAdded + (n - 1) * m_columnSpacing <= available;
        if (!row.isEmpty() && ((attached && attached->newLine()) || !fits))
            place();
        row.append(child);
        rowWidth = std::min(std::max(rowWidth, wanted), available);
    }
    place();

    setImplicitHeight(rows > 0 ? y - m_rowSpacing : 0);
    if (rows != m_rowCount) {
        m_rowCount = rows;
        Q_EMIT rowCountChanged();
    }
    m_laying = false;
}
