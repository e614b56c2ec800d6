#pragma once

#include <QString>
#include <QVector>

class QDBusConnection;

// Who is calling a cover action over the bus, and whether that caller may press it.
//
// The identity comes from what the bus daemon recorded when the caller's connection was
// made (GetConnectionCredentials), not from what the caller's process looks like now: a
// process that later executes a set-uid program, or whose pid is taken over by another
// process, keeps the identity it connected with. A caller is accepted when that identity
// is root's or carries the group "privileged", and its /proc entry is in that group or
// owned by root as well.
class CoverActionCaller
{
public:
    static CoverActionCaller fromBus(const QDBusConnection &connection, const QString &sender);

    uint pid() const { return m_pid; }
    bool isPrivileged() const;

    // Whether a process's /proc entry is in the group "privileged" or owned by root.
    static bool isPrivilegedProcess(uint pid);

private:
    bool m_known = false;   // the daemon answered with a user id
    uint m_pid = 0;
    uint m_uid = 0;
    QVector<uint> m_groups; // primary and supplementary, as recorded at connection time
};
