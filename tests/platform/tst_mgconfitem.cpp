#include "../common/configfixture.h"
#include "mgconfitem.h"

#include <QPoint>
#include <QtTest>

static const QString Root = QStringLiteral("/quorvane/test/mgconfitem/");

class tst_MGConfItem : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { QVERIFY(ConfigFixture::reset(Root)); }
    void cleanupTestCase() { ConfigFixture::reset(Root); }

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
};

QTEST_GUILESS_MAIN(tst_MGConfItem)
#include "tst_mgconfitem.moc"
