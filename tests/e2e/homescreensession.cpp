#include "homescreensession.h"

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QJsonDocument>
#include <QtTest>

namespace {

QString event(const QJsonObject &record) { return record.value(QLatin1String("event")).toString(); }

} // namespace

HomeScreenSession::~HomeScreenSession()
{
    if (QTest::currentTestFailed()) {
        for (const QJsonObject &record : qAsConst(m_records))
            qWarning().noquote() << QJsonDocument(record).toJson(QJsonDocument::Compact);
    }
    stop();
}

bool HomeScreenSession::start(const QString &qmlFile, const QStringList &properties)
{
    static int sessions = 0;
    const QString socket = QStringLiteral("pelkan-e2e-%1-%2").arg(QCoreApplication::applicationPid()).arg(++sessions);
    const QString bin = QCoreApplication::applicationDirPath();

    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
    m_process.setProcessEnvironment(environment);
    m_process.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    QObject::connect(&m_process, &QProcess::readyReadStandardOutput, [this] { readRecords(); });
    // The bus lives as long as the home screen, which lives as long as the application.
    m_process.start(QStringLiteral("dbus-run-session"),
                    QStringList { QStringLiteral("--"), bin + QStringLiteral("/pelkan-home-screen"),
                                  QStringLiteral("--socket"), socket, QStringLiteral("--"),
                                  bin + QStringLiteral("/pelkan-qml-runner"), qmlFile } + properties);
    if (!m_process.waitForStarted())
        return false;
    m_homeScreenPid = waitForEvent(QStringLiteral("ready")).value(QLatin1String("pid")).toVariant().toLongLong();
    m_clientPid = waitForEvent(QStringLiteral("clientStarted")).value(QLatin1String("pid")).toVariant().toLongLong();
    return m_homeScreenPid && m_clientPid;
}

void HomeScreenSession::stop()
{
    if (m_process.state() == QProcess::NotRunning)
        return;
    send(QStringLiteral("quit"));
    if (m_process.waitForFinished(5000))
        return;
    m_process.terminate();
    if (!m_process.waitForFinished(2000)) {
        m_process.kill();
        m_process.waitForFinished(2000);
    }
}

void HomeScreenSession::send(const QString &command)
{
    m_process.write(command.toUtf8() + '\n');
    m_process.waitForBytesWritten(1000);
}

void HomeScreenSession::readRecords()
{
    m_pending += m_process.readAllStandardOutput();
    int end;
    while ((end = m_pending.indexOf('\n')) >= 0) {
        const QJsonDocument document = QJsonDocument::fromJson(m_pending.left(end));
        m_pending.remove(0, end + 1);
        if (document.isObject())
            m_records.append(document.object());
    }
}

bool HomeScreenSession::waitUntil(const std::function<bool()> &done, int timeout) const
{
    QDeadlineTimer deadline(timeout);
    while (!done()) {
        if (deadline.hasExpired() || m_process.state() == QProcess::NotRunning)
            return false;
        QTest::qWait(10);
    }
    return true;
}

QJsonObject HomeScreenSession::waitFor(const Predicate &matches, int timeout)
{
    QJsonObject found;
    waitUntil([&] {
        for (int i = m_seen; i < m_records.size(); ++i) {
            if (matches(m_records.at(i))) {
                m_seen = i + 1;
                found = m_records.at(i);
                return true;
            }
        }
        return false;
    }, timeout);
    return found;
}

QJsonObject HomeScreenSession::waitForEvent(const QString &name, int timeout)
{
    return waitFor([&name](const QJsonObject &record) { return event(record) == name; }, timeout);
}

bool HomeScreenSession::waitForLog(const QString &text, int timeout) const
{
    return waitUntil([&] { return log().contains(text); }, timeout);
}

QString HomeScreenSession::log() const
{
    QString text;
    for (const QJsonObject &record : m_records) {
        if (event(record) == QLatin1String("log"))
            text += record.value(QLatin1String("text")).toString() + QLatin1Char('\n');
    }
    return text;
}

QVector<QJsonObject> HomeScreenSession::properties(int surface) const
{
    QVector<QJsonObject> result;
    for (const QJsonObject &record : m_records) {
        if (event(record) == QLatin1String("property") && record.value(QLatin1String("surface")).toInt() == surface)
            result.append(record);
    }
    return result;
}

bool HomeScreenSession::waitForPropertySequence(int surface, const QStringList &names, int timeout) const
{
    return waitUntil([&] {
        QStringList received;
        for (const QJsonObject &record : properties(surface))
            received << record.value(QLatin1String("name")).toString();
        for (int start = 0; start + names.size() <= received.size(); ++start) {
            if (received.mid(start, names.size()) == names)
                return true;
        }
        return false;
    }, timeout);
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
        if (event(record) == QLatin1String("property") && record.value(QLatin1String("name")).toString() == propertyName)
            return record.value(QLatin1String("surface")).toInt();
    }
    return 0;
}
