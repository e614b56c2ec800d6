#include "dconfwatcher.h"
#include "mgconfitem.h"

#include <QGlobalStatic>
#include <QPointer>

extern "C" {
#include <dconf.h>
}

Q_GLOBAL_STATIC(DConfWatcher, s_watcher)

DConfWatcher *DConfWatcher::instance()
{
    // Null once the process is tearing down statics; items destroyed then just stop watching.
    return s_watcher();
}

DConfWatcher::DConfWatcher()
    : m_client(dconf_client_new())
{
    g_signal_connect(m_client, "changed", G_CALLBACK(&DConfWatcher::changed), this);
}

DConfWatcher::~DConfWatcher()
{
    g_signal_handlers_disconnect_by_data(m_client, this);
    g_object_unref(m_client);
}

void DConfWatcher::add(MGConfItem *item)
{
    QVector<MGConfItem *> &items = m_items[item->key()];
    if (items.isEmpty())
        dconf_client_watch_fast(m_client, item->key().toUtf8().constData());
    items.append(item);
}

void DConfWatcher::remove(MGConfItem *item)
{
    auto it = m_items.find(item->key());
    if (it == m_items.end())
        return;
    it->removeAll(item);
    if (it->isEmpty()) {
        dconf_client_unwatch_fast(m_client, item->key().toUtf8().constData());
        m_items.erase(it);
    }
}

void DConfWatcher::changed(DConfClient *, const char *prefix, const char *const *changes,
                           const char *, void *self)
{
    const QString base = QString::fromUtf8(prefix);
    for (int i = 0; changes[i]; ++i)
        static_cast<DConfWatcher *>(self)->notify(base + QString::fromUtf8(changes[i]));
}

void DConfWatcher::notify(const QString &path)
{
    // Collect first, guarded: an item's valueChanged handler may create or destroy items.
    QVector<QPointer<MGConfItem>> affected;
    auto collect = [&affected](const QVector<MGConfItem *> &items) {
        for (MGConfItem *item : items)
            affected.append(item);
    };
    if (path.endsWith(QLatin1Char('/'))) {
        for (auto it = m_items.cbegin(); it != m_items.cend(); ++it) {
            if (it.key().startsWith(path))
                collect(it.value());
        }
    } else {
        collect(m_items.value(path));
    }

    for (const QPointer<MGConfItem> &item : qAsConst(affected)) {
        if (item)
            item->refresh();
    }
}
