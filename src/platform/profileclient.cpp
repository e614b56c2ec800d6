#include "profileclient.h"

#include "mgconfitem.h"

#include <QByteArray>
#include <QObject>
#include <QVector>

#include <cstdlib>
#include <cstring>

namespace {

const QString Root = QStringLiteral("/quorvane/profile/");

QString activeName(const QVariant &value)
{
    const QString name = value.toString();
    return name.isEmpty() ? QStringLiteral("general") : name;
}

QString valueKey(const QString &profile, const char *key)
{
    return Root + profile + QLatin1Char('/') + QString::fromUtf8(key);
}

struct ActiveCallback {
    profile_track_profile_fn function;
    void *userData;
    profile_user_data_free_fn freeUserData;
};

struct ChangeCallback {
    profile_track_value_fn function;
    void *userData;
    profile_user_data_free_fn freeUserData;
};

// What the tracker follows: the active profile's name and the folder of its values.
struct Tracker {
    int users = 0;
    MGConfItem *active = nullptr;
    QVector<MGConfItem *> values;   // the active profile's keys being watched
    QObject context;                // owns the connections
    QVector<ActiveCallback> activeCallbacks;
    QVector<ChangeCallback> changeCallbacks;
};

Tracker &tracker()
{
    static Tracker instance;
    return instance;
}

void watchValues();

void announceValue(MGConfItem *item)
{
    Tracker &t = tracker();
    const QString key = item->key();
    const QString profile = activeName(t.active ? t.active->value() : QVariant());
    const QByteArray name = key.mid(Root.size() + profile.size() + 1).toUtf8();
    const QByteArray value = item->value().toString().toUtf8();
    const QByteArray type = QByteArray(item->value().typeName());
    const QByteArray profileName = profile.toUtf8();
    const auto callbacks = t.changeCallbacks; // a callback may remove itself
    for (const ChangeCallback &callback : callbacks)
        callback.function(profileName.constData(), name.constData(), value.constData(), type.constData(), callback.userData);
}

void watchValues()
{
    Tracker &t = tracker();
    qDeleteAll(t.values);
    t.values.clear();
    const QString profile = activeName(t.active->value());
    // The keys there now, and the volume even while it is unset (it may be written later).
    QStringList keys = MGConfItem(Root + profile).listEntries();
    const QString volume = valueKey(profile, "touchscreen.tone.volume");
    if (!keys.contains(volume))
        keys.append(volume);
    for (const QString &key : qAsConst(keys)) {
        auto *item = new MGConfItem(key);
        QObject::connect(item, &MGConfItem::valueChanged, &t.context, [item] { announceValue(item); });
        t.values.append(item);
    }
}

void activeChanged()
{
    Tracker &t = tracker();
    watchValues();
    const QByteArray name = activeName(t.active->value()).toUtf8();
    const auto callbacks = t.activeCallbacks;
    for (const ActiveCallback &callback : callbacks)
        callback.function(name.constData(), callback.userData);
    for (MGConfItem *item : qAsConst(t.values))
        announceValue(item);
}

} // namespace

int profile_tracker_init(void)
{
    Tracker &t = tracker();
    if (t.users++ > 0)
        return 0;
    t.active = new MGConfItem(Root + QStringLiteral("active"));
    QObject::connect(t.active, &MGConfItem::valueChanged, &t.context, activeChanged);
    watchValues();
    return 0;
}

void profile_tracker_quit(void)
{
    Tracker &t = tracker();
    if (t.users == 0 || --t.users > 0)
        return;
    qDeleteAll(t.values);
    t.values.clear();
    delete t.active;
    t.active = nullptr;
}

char *profile_get_profile(void)
{
    return strdup(activeName(MGConfItem(Root + QStringLiteral("active")).value()).toUtf8().constData());
}

int profile_get_value_as_int(const char *profile, const char *key)
{
    if (!key)
        return 0;
    const QString name = profile ? QString::fromUtf8(profile) : activeName(MGConfItem(Root + QStringLiteral("active")).value());
    bool ok = false;
    const int value = MGConfItem(valueKey(name, key)).value().toInt(&ok);
    return ok ? value : 0;
}

int profile_get_value_as_bool(const char *profile, const char *key)
{
    if (!key)
        return 0;
    const QString name = profile ? QString::fromUtf8(profile) : activeName(MGConfItem(Root + QStringLiteral("active")).value());
    return MGConfItem(valueKey(name, key)).value().toBool() ? 1 : 0;
}

void profile_track_add_active_cb(profile_track_profile_fn callback, void *user_data,
                                 profile_user_data_free_fn free_user_data)
{
    if (callback)
        tracker().activeCallbacks.append({ callback, user_data, free_user_data });
}

void profile_track_remove_active_cb(profile_track_profile_fn callback, void *user_data)
{
    auto &callbacks = tracker().activeCallbacks;
    for (int i = callbacks.size() - 1; i >= 0; --i) {
        if (callbacks.at(i).function == callback && callbacks.at(i).userData == user_data) {
            const ActiveCallback removed = callbacks.takeAt(i);
            if (removed.freeUserData)
                removed.freeUserData(removed.userData);
        }
    }
}

void profile_track_add_change_cb(profile_track_value_fn callback, void *user_data,
                                 profile_user_data_free_fn free_user_data)
{
    if (callback)
        tracker().changeCallbacks.append({ callback, user_data, free_user_data });
}

void profile_track_remove_change_cb(profile_track_value_fn callback, void *user_data)
{
    auto &callbacks = tracker().changeCallbacks;
    for (int i = callbacks.size() - 1; i >= 0; --i) {
        if (callbacks.at(i).function == callback && callbacks.at(i).userData == user_data) {
            const ChangeCallback removed = callbacks.takeAt(i);
            if (removed.freeUserData)
                removed.freeUserData(removed.userData);
        }
    }
}
