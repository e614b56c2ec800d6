#pragma once

#include <QHash>
#include <QString>
#include <QVector>

typedef struct _DConfClient DConfClient;
class MGConfItem;

// The process-wide dconf client shared by every MGConfItem. It watches each key once,
// however many items look at it, and routes dconf's change notifications to the items
// whose key was written or whose directory was reset.
//
// dconf delivers notifications through the GLib main context that was the thread
// default when the client was made; Qt's GLib event dispatcher runs that context on
// the GUI thread, so items must live on the GUI thread.
class DConfWatcher
{
public:
    static DConfWatcher *instance();

    DConfWatcher();
    ~DConfWatcher();

    DConfClient *client() const { return m_client; }
    void add(MGConfItem *item);
    void remove(MGConfItem *item);

private:
    static void changed(DConfClient *client, const char *prefix, const char *const *changes,
                        const char *tag, void *self);
    void notify(const QString &path);

    DConfClient *m_client;
    QHash<QString, QVector<MGConfItem *>> m_items;
};
