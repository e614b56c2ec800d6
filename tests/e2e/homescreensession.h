#pragma once

#include <QJsonObject>
#include <QProcess>
#include <QStringList>
#include <QVector>

#include <functional>

// One run of an application under the reference home screen: a private session bus, the
// home screen on a private Wayland socket, and the application as a wayland client. It
// collects the home screen's records and the application's log, and stops everything it
// started when it goes away.
class HomeScreenSession
{
public:
    using Predicate = std::function<bool(const QJsonObject &)>;

    HomeScreenSession();
    ~HomeScreenSession();

    // Starts the bus and the home screen; false when either does not come up.
    bool start();
    // Runs the QML file with the given root properties ("name=value").
    bool launch(const QString &qmlFile, const QStringList &properties = {});
    // Stops the application, the home screen and the bus, in that order.
    void stop();

    void send(const QString &command);

    // Waits (up to timeout milliseconds) for a record that matches, looking only at
    // records after the last one a wait returned; returns it, or an empty object.
    QJsonObject waitFor(const Predicate &matches, int timeout = 10000);
    QJsonObject waitForEvent(const QString &event, int timeout = 10000);
    // Waits for the application to log a line containing text.
    bool waitForLog(const QString &text, int timeout = 10000);

    QVector<QJsonObject> records() const { return m_records; }
    QString log() const { return m_log; }
    // The properties of one surface in the order they arrived.
    QVector<QJsonObject> properties(int surface) const;
    // Waits until the surface received these properties one right after the other.
    bool waitForPropertySequence(int surface, const QStringList &names, int timeout = 10000) const;
    // The newest value of a surface's property, or an empty object.
    QJsonObject lastProperty(int surface, const QString &name) const;
    // The surface that carried a property of this name first, or 0.
    int surfaceWith(const QString &propertyName) const;

    qint64 homeScreenPid() const { return m_homeScreen.processId(); }
    QList<qint64> startedPids() const { return m_pids; }

private:
    void readRecords();
    void readLog();

    QProcess m_bus;
    QProcess m_homeScreen;
    QProcess m_application;
    QString m_busAddress;
    QString m_socket;
    QByteArray m_pending;
    QVector<QJsonObject> m_records;
    int m_seen = 0;
    QString m_log;
    QList<qint64> m_pids;
};
