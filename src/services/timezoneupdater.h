#pragma once

#include <QDateTime>
#include <QObject>
#include <QString>

class QFileSystemWatcher;

// Keeps the process's local time zone in step with the device's. The system changes the
// zone by replacing the zone file ("/etc/localtime", usually a symbolic link into the
// zone database); when the file's target or contents change, the C library's zone is
// reloaded and timeZoneChanged() is emitted so that displayed times can be refreshed.
//
// The folder is watched rather than the file alone because a replaced link is a new file
// that a plain file watch would lose.
class TimeZoneUpdater : public QObject
{
    Q_OBJECT

public:
    explicit TimeZoneUpdater(QObject *parent = nullptr);
    explicit TimeZoneUpdater(const QString &zoneFile, QObject *parent = nullptr);

    QString zoneFile() const { return m_zoneFile; }

Q_SIGNALS:
    void timeZoneChanged();

private:
    struct Stamp {
        QString target;
        QDateTime modified;
        qint64 size = -1;
        bool operator==(const Stamp &other) const
        {
            return target == other.target && modified == other.modified && size == other.size;
        }
    };

    Stamp stamp() const;
    void check();
    void watch();

    QString m_zoneFile;
    QFileSystemWatcher *m_watcher;
    Stamp m_stamp;
};
