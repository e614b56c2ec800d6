#include "coveractioncaller.h"

#include <QDBusArgument>
#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusMetaType>
#include <QVariantMap>

#include <grp.h>
#include <pwd.h>
#include <sys/stat.h>

namespace {

const char PrivilegedGroup[] = "privileged";

bool privilegedGroupId(gid_t *id)
{
    const struct group *group = ::getgrnam(PrivilegedGroup);
    if (!group)
        return false;
    *id = group->gr_gid;
    return true;
}

// The groups the user database gives a user: only used with a bus daemon too old to
// record a connection's groups.
QVector<uint> groupsOfUser(uint uid)
{
    QVector<uint> groups;
    const struct passwd *user = ::getpwuid(uid);
    if (!user)
        return groups;
    int count = 64;
    QVector<gid_t> ids(count);
    if (::getgrouplist(user->pw_name, user->pw_gid, ids.data(), &count) < 0) {
        ids.resize(count);
        if (::getgrouplist(user->pw_name, user->pw_gid, ids.data(), &count) < 0)
            return groups;
    }
    for (int i = 0; i < count; ++i)
        groups << uint(ids.at(i));
    return groups;
}

} // namespace

CoverActionCaller CoverActionCaller::fromBus(const QDBusConnection &connection, const QString &sender)
{
    CoverActionCaller caller;
    QDBusMessage call = QDBusMessage::createMethodCall(
            QStringLiteral("org.freedesktop.DBus"), QStringLiteral("/org/freedesktop/DBus"),
            QStringLiteral("org.freedesktop.DBus"), QStringLiteral("GetConnectionCredentials"));
    call << sender;
    const QDBusMessage reply = connection.call(call);
    if (reply.type() != QDBusMessage::ReplyMessage || reply.arguments().isEmpty())
        return caller;
    const QVariantMap credentials = qdbus_cast<QVariantMap>(reply.arguments().constFirst());
    caller.m_pid = credentials.value(QStringLiteral("ProcessID")).toUInt();
    const QVariant uid = credentials.value(QStringLiteral("UnixUserID"));
    if (!uid.isValid())
        return caller;
    caller.m_known = true;
    caller.m_uid = uid.toUInt();
    const QVariant groups = credentials.value(QStringLiteral("UnixGroupIDs"));
    if (groups.isValid()) {
        for (uint group : qdbus_cast<QList<uint>>(groups))
            caller.m_groups << group;
    } else {
        caller.m_groups = groupsOfUser(caller.m_uid);
    }
    return caller;
}

bool CoverActionCaller::isPrivileged() const
{
    if (!m_known || m_pid == 0)
        return false;
    bool connectedAsPrivileged = m_uid == 0;
    gid_t privileged;
    if (!connectedAsPrivileged && privilegedGroupId(&privileged))
        connectedAsPrivileged = m_groups.contains(uint(privileged));
    return connectedAsPrivileged && isPrivilegedProcess(m_pid);
}

bool CoverActionCaller::isPrivilegedProcess(uint pid)
{
    struct stat info;
    if (::stat(QByteArray("/proc/" + QByteArray::number(pid)).constData(), &info) != 0)
        return false;
    if (const struct group *group = ::getgrgid(info.st_gid)) {
        if (qstrcmp(group->gr_name, PrivilegedGroup) == 0)
            return true;
    }
    const struct passwd *owner = ::getpwuid(info.st_uid);
    return owner && qstrcmp(owner->pw_name, "root") == 0;
}
