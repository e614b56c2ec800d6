#pragma once

#include <QObject>
#include <QProcess>
#include <QStringList>

// Starts one application as a client of the home screen (the environment a wayland
// client of it needs, on the given socket), hands on each line it logs, and stops it.
class ClientLauncher : public QObject
{
    Q_OBJECT
public:
    explicit ClientLauncher(QObject *parent = nullptr);
    ~ClientLauncher() override;

    void start(const QString &socketName, const QStringList &command);
    // Asks the application to end, and ends it if it does not within two seconds.
    void stop();
    qint64 processId() const { return m_process.processId(); }

Q_SIGNALS:
    void started(qint64 pid);
    void logged(const QString &line);
    void finished(int exitCode);

private:
    void readOutput();

    QProcess m_process;
    QByteArray m_pending;
};
