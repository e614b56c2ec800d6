#pragma once

#include <QProcess>
#include <QString>
#include <QtTest>

// Writes and resets configuration keys from a separate `dconf` process, as a settings
// application or a shell user would, so that tests see changes arrive from outside.
namespace ConfigFixture {

inline bool dconf(const QStringList &arguments)
{
    QProcess process;
    process.start(QStringLiteral("dconf"), arguments);
    if (!process.waitForFinished(10000) || process.exitStatus() != QProcess::NormalExit
            || process.exitCode() != 0) {
        qWarning() << "dconf" << arguments << "failed:" << process.readAllStandardError();
        return false;
    }
    return true;
}

// value is in GVariant text form: 42, 3.5, true, "'text'", "['a', 'b']".
inline bool write(const QString &key, const QString &value)
{
    return dconf({ QStringLiteral("write"), key, value });
}

inline bool reset(const QString &path)
{
    return dconf({ QStringLiteral("reset"), QStringLiteral("-f"), path });
}

} // namespace ConfigFixture
