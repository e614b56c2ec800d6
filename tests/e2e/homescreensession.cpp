#include "homescreensession.h"

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QJsonDocument>
#include <QtTest>

namespace {

int sessionCount = 0;

void finish(QProcess &process)
{
    if (process.state() == QProcess::NotRunning)
        return;
    process.terminate();
    if (!process.waitForFinished(3000)) {
        process.kill();
        process.waitForFinished(3000);
    }
}

} // namespace

HomeScreenSession::HomeScreenSession()
    : m_socket(QStringLiteral("pelkan-e2e-%1-%2").arg(QCoreApplication::applicationPid()).arg(++sessionCount))
{
}

HomeScreenSession::~HomeScreenSession()
{
    if (QTest::currentTestFailed()) {
        qWarning().noquote() << "Application log:\n" << m_log;
        for (const QJsonObject &record : qAsConst(m_records))
            qWarning().noquote() << QJsonDocument(record).toJson(QJsonDocument::Compact);
    }
    stop();
}

bool HomeScreenSession::start()
{
    m_bus.start(QStringLiteral("dbus-daemon"), { QStringLiteral("--session"), QStringLiteral("--nofork"),
                                                 QStringLiteral("--print-address") });
    if (!m_bus.waitForStarted())
        return false;
    m_pids << m_bus.processId();
    QDeadlineTimer deadline(5000);
    while (!m_bus.canReadLine() && !deadline.hasExpired())
        m_bus.waitForReadyRead(100);
    m_busAddress = QString::fromUtf8(m_bus.readLine()).trimmed();
    if (m_busAddress.isEmpty())
        return false;

    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("DBUS_SESSION_BUS_ADDRESS"), m_busAddress);
    environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
    m_homeScreen.setProcessEnvironment(environment);
    m_homeScreen.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    QObject::connect(&m_homeScreen, &QProcess::readyReadStandardOutput, [this] { readRecords(); });
    m_homeScreen.start(QCoreApplication::applicationDirPath() + QStringLiteral("/pelkan-home-screen"),
                       { QStringLiteral("--socket"), m_socket });
    if (!m_homeScreen.waitForStarted())
        return false;
    m_pids << m_homeScreen.processId();
    return !waitForEvent(QStringLiteral("ready")).isEmpty();
}

bool HomeScreenSession::launch(const QString &qmlFile, const QStringList &properties)
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("DBUS_SESSION_BUS_ADDRESS"), m_busAddress);
    environment.insert(QStringLiteral("WAYLAND_DISPLAY"), m_socket);
    environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("wayland"));
    environment.insert(QStringLiteral("QT_WAYLAND_SHELL_INTEGRATION"), QStringLiteral("wl-shell"));
    environment.insert(QStringLiteral("QT_WAYLAND_DISABLE_WINDOWDECORATION"), QStringLiteral("1"));
    // The home screen takes no GPU buffers: software GL draws into shared memory.
    environment.insert(QStringLiteral("LIBGL_ALWAYS_SOFTWARE"), QStringLiteral("1"));
    environment.remove(QStringLiteral("DISPLAY"));
    m_application.setProcessEnvironment(environment);
    m_application.setProcessChannelMode(QProcess::MergedChannels);
    QObject::connect(&m_application, &QProcess::readyReadStandardOutput, [this] { readLog(); });
    m_application.start(QCoreApplication::applicationDirPath() + QStringLiteral("/pelkan-qml-runner"),
                        QStringList { qmlFile } + properties);
    if (!m_application.waitForStarted())
        return false;
    m_pids << m_application.processId();
    return true;
}

void HomeScreenSession::stop()
{
    finish(m_application);
    if (m_homeScreen.state() != QProcess::NotRunning) {
        send(QStringLiteral("quit"));
        if (!m_homeScreen.waitForFinished(3000))
            finish(m_homeScreen);
    }
    finish(m_bus);
}

void HomeScreenSession::send(const QString &command)
{
    m_homeScreen.write(command.toUtf8() + '\n');
    m_homeScreen.waitForBytesWritten(1000);
}

void HomeScreenSession::readRecords()
{
    m_pending += m_homeScreen.readAllStandardOutput();
    int end;
    while ((end = m_pending.indexOf('\n')) >= 0) {
        const QJsonDocument document = QJsonDocument::fromJson(m_pending.left(end));
        m_pending.remove(0, end + 1);
        if (document.isObject())
            m_records.append(document.object());
    }
}

void HomeScreenSession::readLog()
{
    m_log += QString::fromUtf8(m_application.readAllStandardOutput());
}

QJsonObject HomeScreenSession::waitFor(const Predicate &matches, int timeout)
{
    QDeadlineTimer deadline(timeout);
    for (;;) {
        for (int i = m_seen; i < m_records.size(); ++i) {
            if (matches(m_records.at(i))) {
                m_seen = i + 1;
                return m_records.at(i);
            }
        }
        if (deadline.hasExpired() || m_homeScreen.state() == QProcess::NotRunning)
            return {};
        QTest::qWait(10);
    }
}

QJsonObject HomeScreenSession::waitForEvent(const QString &event, int timeout)
{
    return waitFor([&event](const QJsonObject &record) { return record.value(QLatin1String("event")).toString() == event; },
                   timeout);
}

bool HomeScreenSession::waitForLog(const QString &text, int timeout)
{
    QDeadlineTimer deadline(timeout);
    while (!m_log.contains(text)) {
        if (deadline.hasExpired())
            return false;
        QTest::qWait(10);
    }
    return true;
}

QVector<QJsonObject> HomeScreenSession::properties(int surface) const
{
    QVector<QJsonObject> result;
    for (const QJsonObject &record : m_records) {
        if (record.value(QLatin1String("event")).toString() == QLatin1String("property")
                && record.value(QLatin1String("surface")).toInt() == surface)
            result.append(record);
    }
    return result;
}

bool HomeScreenSession::waitForPropertySequence(int surface, const QStringList &names, int timeout) const
{
    QDeadlineTimer deadline(timeout);
    for (;;) {
        const QVector<QJsonObject> received = properties(surface);
        for (int start = 0; start + names.size() <= received.size(); ++start) {
            int matched = 0;
            while (matched < names.size()
                   && received.at(start + matched).value(QLatin1String("name")).toString() == names.at(matched))
                ++matched;
            if (matched == names.size())
                return true;
        }
        if (deadline.hasExpired())
            return false;
        QTest::qWait(10);
    }
}

QJsonObject HomeScreenSession::lastProperty(int surface, const QString &name) const
{
    const QVector<QJsonObject> all = properties(surface);
    for (auto it = all.crbegin(); it != all.crend(); ++it) {
        if (it->value(QLatin1String("name")).toString() == name)
            return *it;
    }
    return {};
}

int HomeScreenSession::surfaceWith(const QString &propertyName) const
{
    for (const QJsonObject &record : m_records) {
        if (record.value(QLatin1String("event")).toString() == QLatin1String("property")
                && record.value(QLatin1String("name")).toString() == propertyName)
            return record.value(QLatin1String("surface")).toInt();
    }
    return 0;
}
