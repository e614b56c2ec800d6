#include "profilelistener.h"

#include "platform/profileclient.h"

#include <QCoreApplication>

#include <cstdlib>
#include <cstring>

namespace {
const char VolumeKey[] = "touchscreen.tone.volume";
}

ProfileListener *ProfileListener::instance()
{
    static ProfileListener *listener = [] {
        auto *created = new ProfileListener;
        // Gone with the application, before the configuration client it uses.
        if (QCoreApplication::instance())
            created->setParent(QCoreApplication::instance());
        return created;
    }();
    return listener;
}

ProfileListener::ProfileListener()
{
    profile_tracker_init();
    profile_track_add_active_cb(&ProfileListener::activeChanged, this, nullptr);
    profile_track_add_change_cb(&ProfileListener::valueChanged, this, nullptr);
    read();
}

ProfileListener::~ProfileListener()
{
    profile_track_remove_active_cb(&ProfileListener::activeChanged, this);
    profile_track_remove_change_cb(&ProfileListener::valueChanged, this);
    profile_tracker_quit();
}

void ProfileListener::read()
{
    char *name = profile_get_profile();
    const QString profile = QString::fromUtf8(name);
    std::free(name);
    const int volume = profile_get_value_as_int(nullptr, VolumeKey);
    if (profile == m_profile && volume == m_volume)
        return;
    m_profile = profile;
    m_volume = volume;
    Q_EMIT changed();
}

void ProfileListener::activeChanged(const char *, void *self)
{
    static_cast<ProfileListener *>(self)->read();
}

void ProfileListener::valueChanged(const char *, const char *key, const char *, const char *, void *self)
{
    if (key && std::strcmp(key, VolumeKey) == 0)
        static_cast<ProfileListener *>(self)->read();
}
