#include "timezoneupdater.h"
#include "core/pelkanlogging.h"

#include <QFileInfo>
#include <QFileSystemWatcher>

#include <time.h>

TimeZoneUpdater::TimeZoneUpdater(QObject *parent)
    : TimeZoneUpdater(QStringLiteral("/etc/localtime"), parent)
{
}

TimeZoneUpdater::TimeZoneUpdater(const QString &zoneFile, QObject *parent)
    : QObject(parent)
    , m_zoneFile(zoneFile)
    , m_watcher(new QFileSystemWatcher(this))
    , m_stamp(stamp())
{
    connect(m_watcher, &QFileSystemWatcher::directoryChanged, this, &TimeZoneUpdater::check);
    connect(m_watcher, &QFileSystemWatcher::fileChanged, this, &TimeZoneUpdater::check);
    watch();
}

TimeZoneUpdater::Stamp TimeZoneUpdater::stamp() const
{
    const QFileInfo info(m_zoneFile);
    Stamp stamp;
    stamp.target = info.symLinkTarget();
    if (info.exists()) {
        stamp.modified = info.lastModified();
        stamp.size = info.size();
    }
    return stamp;
}

void TimeZoneUpdater::watch()
{
    const QString dir = QFileInfo(m_zoneFile).absolutePath();
    if (!m_watcher->directories().contains(dir) && !m_watcher->addPath(dir))
        qCDebug(lcPelkanServicesLog) << "TimeZoneUpdater: cannot watch" << dir;
    if (QFileInfo::exists(m_zoneFile) && !m_watcher->files().contains(m_zoneFile))
        m_watcher->addPath(m_zoneFile);
}

void TimeZoneUpdater::check()
{
    watch();
    const Stamp now = stamp();
    if (now == m_stamp)
        return;
    m_stamp = now;
    tzset();
    qCDebug(lcPelkanServicesLog) << "TimeZoneUpdater: time zone file changed" << m_zoneFile << now.target;
    Q_EMIT timeZoneChanged();
}
