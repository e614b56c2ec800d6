#include "services/timezoneupdater.h"

#include <QFile>
#include <QTemporaryDir>
#include <QtTest>

class tst_TimeZoneUpdater : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void changes_data()
    {
        // Steps: "link <zone>" replaces the zone file by a link, atomically, the way the
        // system's time settings do; "write <name>" writes a plain file in its folder.
        QTest::addColumn<QStringList>("before");
        QTest::addColumn<QStringList>("steps");
        QTest::addColumn<int>("changes");
        QTest::newRow("replaced link, twice: the folder watch survives")
                << QStringList{ "link Europe/Helsinki" } << QStringList{ "link Asia/Tokyo", "link America/Lima" } << 2;
        QTest::newRow("rewritten file") << QStringList{ "write localtime" } << QStringList{ "write localtime" } << 1;
        QTest::newRow("missing file appearing") << QStringList{} << QStringList{ "link Europe/Helsinki" } << 1;
        QTest::newRow("unrelated file") << QStringList{ "link Europe/Helsinki" } << QStringList{ "write hostname" } << 0;
    }

    void changes()
    {
        QFETCH(QStringList, before);
        QFETCH(QStringList, steps);
        QFETCH(int, changes);
        QTemporaryDir dir;
        const QString zoneFile = dir.filePath(QStringLiteral("localtime"));
        auto apply = [&](const QString &step) {
            const QString argument = step.section(QLatin1Char(' '), 1);
            if (step.startsWith(QLatin1String("write"))) {
                QFile file(dir.filePath(argument));
                return file.open(QIODevice::WriteOnly | QIODevice::Append) && file.write("TZif-more") > 0;
            }
            const QString temporary = zoneFile + QLatin1String(".new");
            return QFile::link(QStringLiteral("/usr/share/zoneinfo/") + argument, temporary)
                    && ::rename(QFile::encodeName(temporary), QFile::encodeName(zoneFile)) == 0;
        };
        for (const QString &step : qAsConst(before))
            QVERIFY(apply(step));
        TimeZoneUpdater updater(zoneFile);
        QSignalSpy changed(&updater, &TimeZoneUpdater::timeZoneChanged);
        for (int i = 0; i < steps.size(); ++i) {
            QVERIFY(apply(steps.at(i)));
            QTRY_COMPARE(changed.count(), qMin(i + 1, changes));
        }
        QTest::qWait(300);
        QCOMPARE(changed.count(), changes);
    }
};

QTEST_GUILESS_MAIN(tst_TimeZoneUpdater)
#include "tst_timezoneupdater.moc"
