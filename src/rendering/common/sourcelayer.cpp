#include "sourcelayer.h"

#include <QHash>

#include <utility>

namespace {

// How many effects hold each layer that effects switched on.
QHash<QQuickItem *, int> &holders()
{
    static QHash<QQuickItem *, int> counts;
    return counts;
}

QObject *layerOf(QQuickItem *item)
{
    return item->property("layer").value<QObject *>();
}

} // namespace

void SourceLayer::hold(QQuickItem *item)
{
    if (item == m_item && item)
        return;
    release();
    if (!item)
        return;
    auto shared = holders().find(item);
    if (shared != holders().end()) {
        ++*shared;
    } else {
        QObject *layer = item->isTextureProvider() ? nullptr : layerOf(item);
        if (!layer || layer->property("enabled").toBool())
            return;
        layer->setProperty("enabled", true);
        holders().insert(item, 1);
        QObject::connect(item, &QObject::destroyed, [item] { holders().remove(item); });
    }
    m_item = item;
}

void SourceLayer::release()
{
    // An item that is gone took its count with it.
    QQuickItem *item = std::exchange(m_item, nullptr);
    if (!item)
        return;
    auto count = holders().find(item);
    if (count == holders().end() || --*count > 0)
        return;
    holders().erase(count);
    if (QObject *layer = layerOf(item))
        layer->setProperty("enabled", false);
}
