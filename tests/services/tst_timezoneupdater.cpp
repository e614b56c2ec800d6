#include "services/timezoneupdater.h"

#include <QFile>
#include <QTemporaryDir>
#include <QtTest>

class tst_TimeZoneUpdater : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void replacedLinkIsNoticed();
    void rewrittenFileIsNoticed();
    void unrelatedFileIsIgnored();
    void missingFileAppearing();

private:
    bool link(const QString &target);
    QScopedPointer<QTemporaryDir> m_dir;
    QString m_zoneFile;
};

void tst_TimeZoneUpdater::init()
{
    m_dir.reset(new QTemporaryDir);
    QVERIFY(m_dir->isValid());
    m_zoneFile = m_dir->filePath(QStringLiteral("localtime"));
}

// Replaces the zone link atomically, the way the system's time settings do.
bool tst_TimeZoneUpdater::link(const QString &target)
{
    const QString temporary = m_zoneFile + QLatin1String(".new");
    QFile::remove(temporary);
    return QFile::link(target, temporary) && ::rename(QFile::encodeName(temporary), QFile::encodeName(m_zoneFile)) == 0;
}

void tst_TimeZoneUpdater::replacedLinkIsNoticed()
{
    QVERIFY(link(QStringLiteral("/usr/share/zoneinfo/Europe/Helsinki")));
    TimeZoneUpdater updater(m_zoneFile);
    QSignalSpy changed(&updater, &TimeZoneUpdater::timeZoneChanged);

    QVERIFY(link(QStringLiteral("/usr/share/zoneinfo/Asia/Tokyo")));
    QTRY_COMPARE(changed.count(), 1);
    // The folder watch survives the replacement: a second change is seen too.
    QVERIFY(link(QStringLiteral("/usr/share/zoneinfo/America/Lima")));
    QTRY_COMPARE(changed.count(), 2);
}

void tst_TimeZoneUpdater::rewrittenFileIsNoticed()
{
    QFile file(m_zoneFile);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write("TZif-one");
    file.close();
    TimeZoneUpdater updater(m_zoneFile);
    QSignalSpy changed(&updater, &TimeZoneUpdater::timeZoneChanged);

    QVERIFY(file.open(QIODevice::WriteOnly | QIODevice::Append));
    file.write("-and-more");
    file.close();
    QTRY_COMPARE(changed.count(), 1);
}

void tst_TimeZoneUpdater::unrelatedFileIsIgnored()
{
    QVERIFY(link(QStringLiteral("/usr/share/zoneinfo/Europe/Helsinki")));
    TimeZoneUpdater updater(m_zoneFile);
    QSignalSpy changed(&updater, &TimeZoneUpdater::timeZoneChanged);

    QFile other(m_dir->filePath(QStringLiteral("hostname")));
    QVERIFY(other.open(QIODevice::WriteOnly));
    other.write("device");
    other.close();
    QTest::qWait(300);
    QCOMPARE(changed.count(), 0);
}

void tst_TimeZoneUpdater::missingFileAppearing()
{
    TimeZoneUpdater updater(m_zoneFile);
    QSignalSpy changed(&updater, &TimeZoneUpdater::timeZoneChanged);
    QVERIFY(link(QStringLiteral("/usr/share/zoneinfo/Europe/Helsinki")));
    QTRY_COMPARE(changed.count(), 1);
}

QTEST_GUILESS_MAIN(tst_TimeZoneUpdater)
#include "tst_timezoneupdater.moc"
