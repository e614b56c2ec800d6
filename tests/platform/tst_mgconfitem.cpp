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

    void roundTrip_data();
    void roundTrip();
    void settingSameValueIsSilent();
    void otherItemsOnTheKeySeeWrites();
    void unsetFallsBackToDefault();
    void externalWrite_data();
    void externalWrite();
    void directoryResetReachesItemsBelow();
    void invalidKey_data();
    void invalidKey();
    void unsupportedTypeKeepsValue();
    void listsDirectoriesAndEntries();
    void itemDestroyedByAnotherItemsHandler();
};

void tst_MGConfItem::roundTrip_data()
{
    QTest::addColumn<QVariant>("value");
    QTest::newRow("bool") << QVariant(true);
    QTest::newRow("int") << QVariant(42);
    QTest::newRow("negative int") << QVariant(-7);
    QTest::newRow("int64") << QVariant(qlonglong(1) << 40);
    QTest::newRow("double") << QVariant(2.75);
    QTest::newRow("string") << QVariant(QStringLiteral("plain"));
    QTest::newRow("unicode string") << QVariant(QStringLiteral("Pärnu – 東京"));
    QTest::newRow("empty string") << QVariant(QString(QLatin1String("")));
    QTest::newRow("string list") << QVariant(QStringList { QStringLiteral("a"), QStringLiteral("b c") });
    QTest::newRow("map") << QVariant(QVariantMap { { QStringLiteral("n"), 1 }, { QStringLiteral("s"), QStringLiteral("x") } });
}

void tst_MGConfItem::roundTrip()
{
    QFETCH(QVariant, value);
    const QString key = Root + QLatin1String("roundtrip");
    {
        MGConfItem writer(key);
        QSignalSpy changed(&writer, &MGConfItem::valueChanged);
        writer.set(value);
        QCOMPARE(writer.value(), value);
        QCOMPARE(changed.count(), 1);
        MGConfItem::sync();
    }
    // A fresh item reads what reached the store, with the same type.
    MGConfItem reader(key);
    QCOMPARE(reader.value(), value);
    QCOMPARE(reader.value().userType(), value.userType());
}

void tst_MGConfItem::settingSameValueIsSilent()
{
    MGConfItem item(Root + QLatin1String("same"));
    item.set(5);
    QSignalSpy changed(&item, &MGConfItem::valueChanged);
    item.set(5);
    QTest::qWait(50);
    QCOMPARE(changed.count(), 0);
    item.set(6);
    QCOMPARE(changed.count(), 1);
}

void tst_MGConfItem::otherItemsOnTheKeySeeWrites()
{
    const QString key = Root + QLatin1String("shared");
    MGConfItem writer(key);
    MGConfItem watcher(key);
    QSignalSpy changed(&watcher, &MGConfItem::valueChanged);
    writer.set(QStringLiteral("hello"));
    QTRY_COMPARE(changed.count(), 1);
    QCOMPARE(watcher.value(), QVariant(QStringLiteral("hello")));
}

void tst_MGConfItem::unsetFallsBackToDefault()
{
    MGConfItem item(Root + QLatin1String("unset"));
    item.set(3);
    QSignalSpy changed(&item, &MGConfItem::valueChanged);
    item.unset();
    QCOMPARE(changed.count(), 1);
    QVERIFY(!item.value().isValid());
    QCOMPARE(item.value(QStringLiteral("default")), QVariant(QStringLiteral("default")));
    MGConfItem::sync();
    QCOMPARE(MGConfItem(item.key()).value(), QVariant());
}

void tst_MGConfItem::externalWrite_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QVariant>("expected");
    QTest::newRow("int") << "42" << QVariant(42);
    QTest::newRow("double") << "3.5" << QVariant(3.5);
    QTest::newRow("bool") << "true" << QVariant(true);
    QTest::newRow("string") << "'text'" << QVariant(QStringLiteral("text"));
    QTest::newRow("string list") << "['a', 'b']" << QVariant(QStringList { QStringLiteral("a"), QStringLiteral("b") });
}

void tst_MGConfItem::externalWrite()
{
    QFETCH(QString, text);
    QFETCH(QVariant, expected);
    MGConfItem item(Root + QLatin1String("external"));
    QSignalSpy changed(&item, &MGConfItem::valueChanged);
    QVERIFY(ConfigFixture::write(item.key(), text));
    QTRY_COMPARE(changed.count(), 1);
    QCOMPARE(item.value(), expected);
}

void tst_MGConfItem::directoryResetReachesItemsBelow()
{
    MGConfItem first(Root + QLatin1String("dir/a"));
    MGConfItem second(Root + QLatin1String("dir/sub/b"));
    MGConfItem outside(Root + QLatin1String("other"));
    first.set(1);
    second.set(2);
    outside.set(3);
    MGConfItem::sync();

    QSignalSpy firstChanged(&first, &MGConfItem::valueChanged);
    QSignalSpy secondChanged(&second, &MGConfItem::valueChanged);
    QSignalSpy outsideChanged(&outside, &MGConfItem::valueChanged);
    QVERIFY(ConfigFixture::reset(Root + QLatin1String("dir/")));
    QTRY_COMPARE(firstChanged.count(), 1);
    QTRY_COMPARE(secondChanged.count(), 1);
    QVERIFY(!first.value().isValid());
    QVERIFY(!second.value().isValid());
    QCOMPARE(outsideChanged.count(), 0);
    QCOMPARE(outside.value(), QVariant(3));
}

void tst_MGConfItem::invalidKey_data()
{
    QTest::addColumn<QString>("key");
    QTest::newRow("relative") << "quorvane/test";
    QTest::newRow("trailing slash") << "/quorvane/test/";
    QTest::newRow("double slash") << "/quorvane//test";
    QTest::newRow("empty") << "";
}

void tst_MGConfItem::invalidKey()
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

void tst_MGConfItem::unsupportedTypeKeepsValue()
{
    MGConfItem item(Root + QLatin1String("unsupported"));
    item.set(7);
    QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^MGConfItem: cannot store a value of type QPoint")));
    item.set(QPoint(1, 2));
    QCOMPARE(item.value(), QVariant(7));
}

void tst_MGConfItem::listsDirectoriesAndEntries()
{
    MGConfItem(Root + QLatin1String("tree/x")).set(1);
    MGConfItem(Root + QLatin1String("tree/y")).set(2);
    MGConfItem(Root + QLatin1String("tree/sub/z")).set(3);
    MGConfItem::sync();

    MGConfItem tree(Root + QLatin1String("tree"));
    QCOMPARE(tree.listEntries(), QStringList({ Root + QLatin1String("tree/x"), Root + QLatin1String("tree/y") }));
    QCOMPARE(tree.listDirs(), QStringList({ Root + QLatin1String("tree/sub") }));
}

void tst_MGConfItem::itemDestroyedByAnotherItemsHandler()
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

QTEST_GUILESS_MAIN(tst_MGConfItem)
#include "tst_mgconfitem.moc"
