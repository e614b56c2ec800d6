#include "../common/configfixture.h"
#include "../common/sceneview.h"
#include "mgconfitem.h"
#include "services/timezoneupdater.h"
#include "text/declarativeformatter.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QQmlEngine>
#include <QTemporaryDir>
#include <QtTest>

#include <cstdlib>
#include <ctime>

static const QByteArray Imports = "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\nimport Quorvane.Pelkan.private 1.0 as Private\n";
static const QString Key = QStringLiteral("/desktop/pelkan-test/columns");
static const QString ProfileRoot = QStringLiteral("/quorvane/profile/");
static const QString Root = QStringLiteral("/quorvane/test/mgconfitem/");

// Configuration, sound profile, time zone and clipboard as QML sees them: bindings follow
// changes written from another process or made by the system, live. And what is behind
// them: the configuration items and the watcher of the time-zone file.
class tst_PlatformServices : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { QVERIFY(ConfigFixture::reset(Root)); }
    void cleanup()
    {
        ConfigFixture::reset(QStringLiteral("/desktop/pelkan-test/"));
        ConfigFixture::reset(Root);
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

        QQuickView window(&m_engine, nullptr);
        QObject *object = showScene(window, Imports + "Item { width: 200; height: 100\n"
                                                      "  property var played: []\n"
                                                      "  property real level: Private.Util.touchToneLevel\n"
                                                      "  Connections { target: Private.Util; function onTouchFeedback(level) { played.push(level) } }\n"
                                                      "  Button { text: 'Tap' } }");
        QVERIFY(object);

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

    void values_data()
    {
        QTest::addColumn<QVariant>("value");
        QTest::addColumn<QString>("text"); // the same value written from outside, GVariant text
        QTest::newRow("bool") << QVariant(true) << "true";
        QTest::newRow("int") << QVariant(42) << "42";
        QTest::newRow("negative int") << QVariant(-7) << "";
        QTest::newRow("int64") << QVariant(qlonglong(1) << 40) << "";
        QTest::newRow("double") << QVariant(2.75) << "2.75";
        QTest::newRow("string") << QVariant(QStringLiteral("plain")) << "'plain'";
        QTest::newRow("unicode string") << QVariant(QStringLiteral("Pärnu – 東京")) << "";
        QTest::newRow("empty string") << QVariant(QString(QLatin1String(""))) << "";
        QTest::newRow("string list") << QVariant(QStringList { QStringLiteral("a"), QStringLiteral("b c") }) << "['a', 'b c']";
        QTest::newRow("map") << QVariant(QVariantMap { { QStringLiteral("n"), 1 }, { QStringLiteral("s"), QStringLiteral("x") } }) << "";
    }

    // A value written reaches the store with its type; one written from outside reaches an
    // item that watches the key.
    void values()
    {
        QFETCH(QVariant, value);
        QFETCH(QString, text);
        const QString key = Root + QLatin1String("value");
        {
            MGConfItem writer(key);
            QSignalSpy changed(&writer, &MGConfItem::valueChanged);
            writer.set(value);
            QCOMPARE(writer.value(), value);
            QCOMPARE(changed.count(), 1);
            MGConfItem::sync();
        }
        MGConfItem reader(key);
        QCOMPARE(reader.value(), value);
        QCOMPARE(reader.value().userType(), value.userType());
        if (text.isEmpty())
            return;
        QVERIFY(ConfigFixture::reset(key));
        QTRY_VERIFY(!reader.value().isValid());
        QSignalSpy changed(&reader, &MGConfItem::valueChanged);
        QVERIFY(ConfigFixture::write(key, text));
        QTRY_COMPARE(changed.count(), 1);
        QCOMPARE(reader.value(), value);
    }

    // A write reaches every item on the key, once per real change; unset gives the default.
    void writesReachEveryItemOnTheKey()
    {
        const QString key = Root + QLatin1String("shared");
        MGConfItem writer(key);
        MGConfItem watcher(key);
        writer.set(5);
        QTRY_COMPARE(watcher.value(), QVariant(5));
        QSignalSpy changed(&writer, &MGConfItem::valueChanged);
        QSignalSpy seen(&watcher, &MGConfItem::valueChanged);
        writer.set(5);
        QTest::qWait(50);
        QCOMPARE(changed.count() + seen.count(), 0);
        writer.set(QStringLiteral("hello"));
        QCOMPARE(changed.count(), 1);
        QTRY_COMPARE(seen.count(), 1);
        QCOMPARE(watcher.value(), QVariant(QStringLiteral("hello")));

        writer.unset();
        QCOMPARE(changed.count(), 2);
        QVERIFY(!writer.value().isValid());
        QCOMPARE(writer.value(QStringLiteral("default")), QVariant(QStringLiteral("default")));
        MGConfItem::sync();
        QCOMPARE(MGConfItem(key).value(), QVariant());
    }

    // A folder lists its entries and folders; resetting it reaches the items below only.
    void directories()
    {
        MGConfItem first(Root + QLatin1String("dir/a"));
        MGConfItem second(Root + QLatin1String("dir/b"));
        MGConfItem below(Root + QLatin1String("dir/sub/c"));
        MGConfItem outside(Root + QLatin1String("other"));
        first.set(1);
        second.set(2);
        below.set(3);
        outside.set(4);
        MGConfItem::sync();
        MGConfItem folder(Root + QLatin1String("dir"));
        QCOMPARE(folder.listEntries(), QStringList({ first.key(), second.key() }));
        QCOMPARE(folder.listDirs(), QStringList({ Root + QLatin1String("dir/sub") }));

        QSignalSpy firstChanged(&first, &MGConfItem::valueChanged);
        QSignalSpy belowChanged(&below, &MGConfItem::valueChanged);
        QSignalSpy outsideChanged(&outside, &MGConfItem::valueChanged);
        QVERIFY(ConfigFixture::reset(Root + QLatin1String("dir/")));
        QTRY_COMPARE(firstChanged.count(), 1);
        QTRY_COMPARE(belowChanged.count(), 1);
        QVERIFY(!first.value().isValid());
        QVERIFY(!below.value().isValid());
        QCOMPARE(outsideChanged.count(), 0);
        QCOMPARE(outside.value(), QVariant(4));
    }

    void invalidKey_data()
    {
        QTest::addColumn<QString>("key");
        QTest::newRow("relative") << "quorvane/test";
        QTest::newRow("trailing slash") << "/quorvane/test/";
        QTest::newRow("double slash") << "/quorvane//test";
        QTest::newRow("empty") << "";
    }

    void invalidKey()
    {
        QFETCH(QString, key);
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^MGConfItem: invalid configuration key")));
        MGConfItem item(key);
        QVERIFY(!item.isValid());
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^MGConfItem: cannot write invalid key")));
        item.set(1);
        QVERIFY(!item.value().isValid());
        item.unset();
        QVERIFY(item.listEntries().isEmpty());
    }

    void unsupportedTypeKeepsValue()
    {
        MGConfItem item(Root + QLatin1String("unsupported"));
        item.set(7);
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^MGConfItem: cannot store a value of type QPoint")));
        item.set(QPoint(1, 2));
        QCOMPARE(item.value(), QVariant(7));
    }

    void itemDestroyedByAnotherItemsHandler()
    {
        const QString key = Root + QLatin1String("teardown");
        MGConfItem writer(key);
        auto first = new MGConfItem(key);
        auto second = new MGConfItem(key);
        QPointer<MGConfItem> guard(second);
        connect(first, &MGConfItem::valueChanged, second, [second] { delete second; });

        writer.set(1);
        QTRY_VERIFY(guard.isNull());
        // The store keeps working for the survivors.
        writer.set(2);
        QTRY_COMPARE(first->value(), QVariant(2));
        delete first;
    }

private:
    QObject *create(const QByteArray &body);
    QQmlEngine m_engine;
};

QObject *tst_PlatformServices::create(const QByteArray &body)
{
    QQmlComponent component(&m_engine);
    component.setData(Imports + body, QUrl());
    QObject *object = component.create();
    if (!object)
        qWarning() << component.errorString();
    return object;
}

QTEST_MAIN(tst_PlatformServices)
#include "tst_platformservices.moc"
