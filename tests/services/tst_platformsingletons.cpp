#include <QClipboard>
#include <QDir>
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QtTest>

// The platform singletons as QML sees them, through the installed module.
class tst_PlatformSingletons : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void standardPaths_data();
    void standardPaths();
    void clipboard();

private:
    QObject *singleton(const char *name);
    QQmlEngine m_engine;
    QObjectList m_roots;
};

QObject *tst_PlatformSingletons::singleton(const char *name)
{
    QQmlComponent component(&m_engine);
    component.setData(QByteArray("import QtQml 2.2\nimport Quorvane.Pelkan 1.0\nQtObject { property QtObject it: ") + name
                              + " }\n", QUrl());
    QObject *root = component.create();
    if (!root) {
        qWarning() << component.errorString();
        return nullptr;
    }
    m_roots << root;
    return root->property("it").value<QObject *>();
}

void tst_PlatformSingletons::standardPaths_data()
{
    QTest::addColumn<QString>("property");
    QTest::addColumn<QString>("expected");
    QTest::newRow("home") << "home" << QDir::homePath();
    // The test run's own data and cache folders (scripts/run-tests sets them), with this
    // application's name.
    if (qEnvironmentVariableIsSet("XDG_DATA_HOME") && qEnvironmentVariableIsSet("XDG_CACHE_HOME")) {
        QTest::newRow("data") << "data" << qEnvironmentVariable("XDG_DATA_HOME") + QLatin1String("/tst_platformsingletons");
        QTest::newRow("cache") << "cache" << qEnvironmentVariable("XDG_CACHE_HOME") + QLatin1String("/tst_platformsingletons");
    }
    QTest::newRow("temporary") << "temporary" << QDir::tempPath();
}

void tst_PlatformSingletons::standardPaths()
{
    QFETCH(QString, property);
    QFETCH(QString, expected);
    QObject *paths = singleton("StandardPaths");
    QVERIFY(paths);
    QCOMPARE(paths->property(property.toLatin1()).toString(), expected);
}

void tst_PlatformSingletons::clipboard()
{
    QGuiApplication::clipboard()->clear();
    QObject *clipboard = singleton("Clipboard");
    QVERIFY(clipboard);
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

QTEST_MAIN(tst_PlatformSingletons)
#include "tst_platformsingletons.moc"
