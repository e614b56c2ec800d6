#include "../common/configfixture.h"
#include "services/timezoneupdater.h"
#include "text/declarativeformatter.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTemporaryDir>
#include <QtTest>

#include <cstdlib>
#include <ctime>

static const QString Key = QStringLiteral("/desktop/pelkan-test/columns");
static const QString ProfileRoot = QStringLiteral("/quorvane/profile/");

// Configuration, sound profile, time zone and clipboard as QML sees them: bindings follow
// changes written from another process or made by the system, live. And the watcher of
// the time-zone file behind them.
class tst_PlatformServices : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup()
    {
        ConfigFixture::reset(QStringLiteral("/desktop/pelkan-test/"));
        ConfigFixture::reset(ProfileRoot);
        ConfigFixture::reset(QStringLiteral("/quorvane/i18n/"));
    }

    // What a binding reads through Config as values are written from outside.
    void configBinding_data()
    {
        QTest::addColumn<QByteArray>("defaultValue");
        QTest::addColumn<QString>("written"); // GVariant text
        QTest::addColumn<QVariant>("read");
        QTest::addColumn<bool>("warns");
        QTest::newRow("number") << QByteArray("3") << "5" << QVariant(5) << false;
        QTest::newRow("fraction for a number") << QByteArray("3") << "2.5" << QVariant(2.5) << false;
        QTest::newRow("text") << QByteArray("'a'") << "'b'" << QVariant(QStringLiteral("b")) << false;
        QTest::newRow("text for a number: the default") << QByteArray("3") << "'many'" << QVariant(3) << true;
        QTest::newRow("number for a flag: the default") << QByteArray("true") << "7" << QVariant(true) << true;
        QTest::newRow("no default: as stored") << QByteArray("undefined") << "[1, 2]" << QVariant(QVariantList { 1, 2 }) << false;
    }

    void configBinding()
    {
        QFETCH(QByteArray, defaultValue);
        QFETCH(QString, written);
        QFETCH(QVariant, read);
        QFETCH(bool, warns);

        QScopedPointer<QObject> object(create("QtObject { property QtObject config: Private.Config\n"
                                              "  property var read: config.value(\"" + Key.toUtf8() + "\", " + defaultValue + ") }"));
        QVERIFY(object);
        QSignalSpy arrived(object->property("config").value<QObject *>(), SIGNAL(valueChanged(QString)));
        const QVariant unset = object->property("read");
        QCOMPARE(unset.isValid(), defaultValue != "undefined");

        if (warns)
            QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("Config: the value of \"%1\"").arg(Key)));
        QVERIFY(ConfigFixture::write(Key, written));
        QTRY_VERIFY(!arrived.isEmpty());
        QCOMPARE(object->property("read"), read);

        arrived.clear();
        QVERIFY(ConfigFixture::reset(Key));
        QTRY_VERIFY(!arrived.isEmpty());
        QCOMPARE(object->property("read"), unset);
    }

    // A press on a button plays a touch tone at the active profile's level, or none.
    void touchFeedback_data()
    {
        QTest::addColumn<QString>("profile");
        QTest::addColumn<int>("volume");
        QTest::addColumn<QVariantList>("played");
        QTest::newRow("general, loud") << "general" << 80 << QVariantList { 0.8 };
        QTest::newRow("general, quiet") << "general" << 20 << QVariantList { 0.2 };
        QTest::newRow("general, off") << "general" << 0 << QVariantList {};
        QTest::newRow("silent mutes") << "silent" << 80 << QVariantList {};
    }

    void touchFeedback()
    {
        QFETCH(QString, profile);
        QFETCH(int, volume);
        QFETCH(QVariantList, played);

        QScopedPointer<QObject> object(create("Item { width: 200; height: 100\n"
                                              "  property var played: []\n"
                                              "  property real level: Private.Util.touchToneLevel\n"
                                              "  Connections { target: Private.Util; function onTouchFeedback(level) { played.push(level) } }\n"
                                              "  Button { objectName: 'button'; text: 'Tap' } }"));
        QVERIFY(object);
        QQuickWindow window;
        window.resize(200, 100);
        qobject_cast<QQuickItem *>(object.data())->setParentItem(window.contentItem());
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));

        QVERIFY(ConfigFixture::write(ProfileRoot + profile + QStringLiteral("/touchscreen.tone.volume"), QString::number(volume)));
        QVERIFY(ConfigFixture::write(ProfileRoot + QStringLiteral("active"), QStringLiteral("'%1'").arg(profile)));
        const qreal level = profile == QLatin1String("silent") ? 0 : volume / 100.0;
        QTRY_COMPARE(object->property("level").toReal(), level);

        QTest::mouseClick(&window, Qt::LeftButton, {}, QPoint(20, 20));
        QCOMPARE(object->property("played").toList(), played);
    }

    // A formatted time in a binding follows the device's time zone and 12/24-hour setting.
    void formattedTimeFollows_data()
    {
        QTest::addColumn<QByteArray>("zone");
        QTest::addColumn<QString>("hourMode"); // GVariant text, empty: unset
        QTest::addColumn<QString>("shown");
        QTest::newRow("another zone") << QByteArray("EET-2") << QString() << "14:00";
        QTest::newRow("12-hour clock") << QByteArray("UTC0") << "'12'" << "12:00 PM";
    }

    void formattedTimeFollows()
    {
        QFETCH(QByteArray, zone);
        QFETCH(QString, hourMode);
        QFETCH(QString, shown);

        const QByteArray original = qgetenv("TZ");
        qputenv("TZ", "UTC0");
        tzset();
        QScopedPointer<QObject> object(create("QtObject { property string shown: "
                                              "Format.formatDate(new Date(Date.UTC(2026, 0, 1, 12, 0)), Formatter.TimeValue) }"));
        QVERIFY(object);
        QCOMPARE(object->property("shown").toString(), QStringLiteral("12:00"));

        // What the time-zone updater does when the device's zone changes.
        qputenv("TZ", zone);
        tzset();
        DeclarativeFormatter::notifyTimeZoneChanged();
        if (!hourMode.isEmpty())
            QVERIFY(ConfigFixture::write(QStringLiteral("/quorvane/i18n/lc_timeformat24h"), hourMode));
        QTRY_COMPARE(object->property("shown").toString(), shown);

        if (original.isEmpty())
            qunsetenv("TZ");
        else
            qputenv("TZ", original);
        tzset();
    }

    // Util's lookups walk up from the item's parent; anything but an item finds nothing. The
    // calls run in order on the same types, so answers kept per type and name must not leak.
    void ancestorLookups()
    {
        QScopedPointer<QObject> object(create("Flickable { objectName: 'flickable'\n"
                                              "  function name(found) { return found ? found.objectName : '-' }\n"
                                              "  property var results: [\n"
                                              "    name(Private.Util.findAncestor(leaf, 'marker')), name(Private.Util.findAncestor(holder, 'marker')),\n"
                                              "    name(Private.Util.findAncestor(leaf, 'status')), name(Private.Util.findAncestor(leaf, 'nowhere')),\n"
                                              "    name(Private.Util.findFlickable(leaf)), name(Private.Util.findPage(leaf)),\n"
                                              "    name(Private.Util.findPage(page)), name(Private.Util.findAncestor(null, 'marker')),\n"
                                              "    name(Private.Util.findFlickable(plain)) ]\n"
                                              "  property QtObject plain: QtObject {}\n"
                                              "  Item { id: outer; objectName: 'outer'; property bool marker\n"
                                              "    Item { id: page; objectName: 'page'; property Item pageStack; property int status\n"
                                              "                     property int allowedOrientations\n"
                                              "      Item { id: holder; objectName: 'holder'; property bool marker\n"
                                              "        Item { id: leaf } } } } }"));
        QVERIFY(object);
        QCOMPARE(object->property("results").toStringList(),
                 QStringList({ "holder", "outer", "page", "-", "flickable", "page", "-", "-", "-" }));
    }

    void clipboard()
    {
        QGuiApplication::clipboard()->clear();
        QScopedPointer<QObject> object(create("QtObject { property QtObject it: Clipboard }"));
        QVERIFY(object);
        QObject *clipboard = object->property("it").value<QObject *>();
        QTRY_VERIFY(!clipboard->property("hasText").toBool());
        QSignalSpy text(clipboard, SIGNAL(textChanged()));
        QSignalSpy hasText(clipboard, SIGNAL(hasTextChanged()));

        // Another writer is seen.
        QGuiApplication::clipboard()->setText(QStringLiteral("copied"));
        QTRY_COMPARE(clipboard->property("text").toString(), QStringLiteral("copied"));
        QVERIFY(clipboard->property("hasText").toBool());
        QCOMPARE(text.count(), 1);
        QCOMPARE(hasText.count(), 1);

        // Writing from QML reaches the system clipboard.
        QVERIFY(clipboard->setProperty("text", QStringLiteral("pasted")));
        QTRY_COMPARE(QGuiApplication::clipboard()->text(), QStringLiteral("pasted"));
        QTRY_COMPARE(text.count(), 2);
        QCOMPARE(hasText.count(), 1);

        QVERIFY(clipboard->setProperty("text", QString()));
        QTRY_VERIFY(!clipboard->property("hasText").toBool());
        QCOMPARE(hasText.count(), 2);
    }

    // The time-zone updater sees the zone file replaced or rewritten, and nothing else.
    void timeZoneFileChanges_data()
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

    void timeZoneFileChanges()
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

private:
    QObject *create(const QByteArray &body);
    QQmlEngine m_engine;
};

QObject *tst_PlatformServices::create(const QByteArray &body)
{
    QQmlComponent component(&m_engine);
    component.setData("import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\nimport Quorvane.Pelkan.private 1.0 as Private\n"
                      + body, QUrl());
    QObject *object = component.create();
    if (!object)
        qWarning() << component.errorString();
    return object;
}

QTEST_MAIN(tst_PlatformServices)
#include "tst_platformservices.moc"
