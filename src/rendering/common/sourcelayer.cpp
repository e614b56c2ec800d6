#include "sourcelayer.h"

#include <utility>

void SourceLayer::hold(QQuickItem *item)
{
    if (item == m_item)
        return;
    release();
    if (!item || item->isTextureProvider())
        return;
    QObject *layer = item->property("layer").value<QObject *>();
    if (layer && !layer->property("enabled").toBool()) {
        layer->setProperty("enabled", true);
        m_item = item;
    }
}

void SourceLayer::release()
{
    if (QQuickItem *item = std::exchange(m_item, nullptr)) {
        if (QObject *layer = item->property("layer").value<QObject *>())
            layer->setProperty("enabled", false);
    }
}
