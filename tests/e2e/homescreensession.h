#pragma once

#include <QJsonObject>
#include <QProcess>
#include <QStringList>
#include <QVector>

#include <functional>

// One run of an application under the reference home screen, on a private session bus
// and a private Wayland socket. It collects the home screen's records (the application's
// log among them) and ends everything it started when it goes away.
class HomeScreenSession
{
public:
    using Predicate = std::function<bool(const QJsonObject &)>;

    ~HomeScreenSession();

    // Runs the QML file with the given root properties ("name=value"); false when the
    // home screen or the application does not come up.
    bool start(const QString &qmlFile, const QStringList &properties = {});
    // Ends the application, then the home screen and its bus.
    void stop();

    void send(const QString &command);

    // Waits (up to timeout milliseconds) for a record that matches, looking only at
    // records after the last one a wait returned; returns it, or an empty object.
    QJsonObject waitFor(const Predicate &matches, int timeout = 10000);
    QJsonObject waitForEvent(const QString &event, int timeout = 10000);
    // Waits for the application to log a line containing text.
    bool waitForLog(const QString &text, int timeout = 10000) const;
    QString log() const;

    // The properties of one surface in the order they arrived.
    QVector<QJsonObject> properties(int surface) const;
    // Waits until the surface received these properties one right after the other.
    bool waitForPropertySequence(int surface, const QStringList &names, int timeout = 10000) const;
    // The newest value of a surface's property, or an empty object.
    QJsonObject lastProperty(int surface, const QString &name) const;
    // The surface that carried a property of this name first, or 0.
    int surfaceWith(const QString &propertyName) const;

    qint64 homeScreenPid() const { return m_homeScreenPid; }
    // The bus runner, the home screen and the application.
    QList<qint64> startedPids() const { return { m_process.processId(), m_homeScreenPid, m_clientPid }; }

private:
    bool waitUntil(const std::function<bool()> &done, int timeout) const;
    void readRecords();

    QProcess m_process;
    QByteArray m_pending;
    QVector<QJsonObject> m_records;
    int m_seen = 0;
    qint64 m_homeScreenPid = 0;
    qint64 m_clientPid = 0;
};
