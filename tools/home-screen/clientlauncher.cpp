#include "clientlauncher.h"

ClientLauncher::ClientLauncher(QObject *parent)
    : QObject(parent)
{
    m_process.setProcessChannelMode(QProcess::MergedChannels);
    connect(&m_process, &QProcess::readyReadStandardOutput, this, &ClientLauncher::readOutput);
    connect(&m_process, QOverload<int, QProcess::ExitStatus>::of(&QProcess::finished), this,
            [this](int exitCode, QProcess::ExitStatus status) {
                readOutput();
                Q_EMIT finished(status == QProcess::NormalExit ? exitCode : -1);
            });
    connect(&m_process, &QProcess::errorOccurred, this, [this](QProcess::ProcessError error) {
        if (error == QProcess::FailedToStart) {
            Q_EMIT logged(m_process.errorString());
            Q_EMIT finished(-1);
        }
    });
}

ClientLauncher::~ClientLauncher()
{
    stop();
}

void ClientLauncher::start(const QString &socketName, const QStringList &command)
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("WAYLAND_DISPLAY"), socketName);
    environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("wayland"));
    // The shell whose surfaces carry the property channel.
    environment.insert(QStringLiteral("QT_WAYLAND_SHELL_INTEGRATION"), QStringLiteral("wl-shell"));
    environment.insert(QStringLiteral("QT_WAYLAND_DISABLE_WINDOWDECORATION"), QStringLiteral("1"));
    // No GPU buffers are taken here: software GL draws into shared memory.
    environment.insert(QStringLiteral("LIBGL_ALWAYS_SOFTWARE"), QStringLiteral("1"));
    environment.remove(QStringLiteral("DISPLAY"));
    m_process.setProcessEnvironment(environment);
    m_process.start(command.first(), command.mid(1));
    if (m_process.waitForStarted())
        Q_EMIT started(m_process.processId());
}

void ClientLauncher::stop()
{
    if (m_process.state() == QProcess::NotRunning)
        return;
    m_process.terminate();
    if (!m_process.waitForFinished(2000)) {
        m_process.kill();
        m_process.waitForFinished(2000);
    }
}

void ClientLauncher::readOutput()
{
    m_pending += m_process.readAllStandardOutput();
    int end;
    while ((end = m_pending.indexOf('\n')) >= 0) {
        Q_EMIT logged(QString::fromUtf8(m_pending.left(end)));
        m_pending.remove(0, end + 1);
    }
}
