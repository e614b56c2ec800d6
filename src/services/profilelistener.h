#pragma once

#include <QObject>

// Follows the active sound profile for touch feedback: the profile's touch-tone volume
// (0-100) and whether the profile is the silent one, which mutes touch tones whatever the
// volume says. One per process (instance()), live through the profile client.
class ProfileListener : public QObject
{
    Q_OBJECT
    Q_PROPERTY(int touchToneVolume READ touchToneVolume NOTIFY changed)
    Q_PROPERTY(bool silent READ silent NOTIFY changed)
    Q_PROPERTY(QString profile READ profile NOTIFY changed)

public:
    static ProfileListener *instance();
    ~ProfileListener() override;

    int touchToneVolume() const { return m_volume; }
    bool silent() const { return m_profile == QLatin1String("silent"); }
    QString profile() const { return m_profile; }
    // The level a touch tone plays at now: 0..1, 0 for none.
    qreal touchToneLevel() const { return silent() ? 0 : qBound(0, m_volume, 100) / 100.0; }

Q_SIGNALS:
    void changed();

private:
    ProfileListener();
    void read();
    static void activeChanged(const char *profile, void *self);
    static void valueChanged(const char *profile, const char *key, const char *value, const char *type, void *self);

    QString m_profile;
    int m_volume = 0;
};
