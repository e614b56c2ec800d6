#pragma once

#include <QQuickItem>
#include <QQuickWindow>
#include <QVariant>

#include <cmath>

// Whether every row a list shows is there: the benchmark documents name their row lists
// "rows", and a page counts as drawn once each list in view holds a visible delegate for
// every row position inside it. Toolkits that incubate their delegates over several
// frames therefore do not finish before the rows the user sees exist.
namespace Rows {

namespace Detail {

inline bool shown(QQuickItem *item)
{
    if (!item->isVisible() || item->opacity() <= 0 || item->width() <= 0 || item->height() <= 0)
        return false;
    const QRectF inScene = item->mapRectToScene(QRectF(0, 0, item->width(), item->height()));
    const QSizeF size = item->window() ? QSizeF(item->window()->size()) : QSizeF();
    return inScene.intersects(QRectF(QPointF(0, 0), size));
}

inline void collect(QQuickItem *item, QList<QQuickItem *> &lists)
{
    if (item->objectName() == QLatin1String("rows") && shown(item)) {
        lists.append(item);
        return;
    }
    const QList<QQuickItem *> children = item->childItems();
    for (QQuickItem *child : children)
        collect(child, lists);
}

// Every row position of the list's viewport holds a drawn delegate.
inline bool complete(QQuickItem *list)
{
    const int count = list->property("count").toInt();
    auto content = list->property("contentItem").value<QQuickItem *>();
    if (!content)
        return false;
    const qreal top = list->property("contentY").toReal();
    const qreal bottom = top + list->height();
    int inView = 0;
    qreal rowHeight = 0;
    const QList<QQuickItem *> delegates = content->childItems();
    for (QQuickItem *row : delegates) {
        if (!row->isVisible() || row->height() <= 0 || row->y() + row->height() <= top || row->y() >= bottom)
            continue;
        ++inView;
        rowHeight = qMax(rowHeight, row->height());
    }
    if (count == 0)
        return true;
    if (inView == 0)
        return false;
    const int needed = qMin(count, int(std::ceil(list->height() / rowHeight - 1e-6)));
    return inView >= needed;
}

} // namespace Detail

// True when at least one row list is in view and every one in view is complete.
inline bool allDrawn(QQuickWindow *window)
{
    QList<QQuickItem *> lists;
    Detail::collect(window->contentItem(), lists);
    if (lists.isEmpty())
        return false;
    for (QQuickItem *list : lists) {
        if (!Detail::complete(list))
            return false;
    }
    return true;
}

} // namespace Rows
