#include "../common/pluginloader.h"
#include "screen.h"
#include "services/timezoneupdater.h"

#include <QQmlComponent>
#include <QQmlContext>
#include <QQmlEngine>
#include <QQuickImageProvider>
#include <QTranslator>
#include <QtTest>

static const char TestCatalogues[] = TEST_CATALOGUE_DIR;

class tst_EngineInitialization : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void contextProperties()
    {
        QScopedPointer<QQmlEngine> engine(importingEngine());
        QQmlContext *context = engine->rootContext();
        QCOMPARE(context->contextProperty(QStringLiteral("screen")).value<QObject *>(), Pelkan::Screen::instance());
        const QVariant format = context->contextProperty(QStringLiteral("_defaultLabelFormat"));
        QCOMPARE(format.userType(), int(QMetaType::Int));
        QCOMPARE(format.toInt(), 0);
    }

    void translatorsInstalledAndRemovedWithEngine()
    {
        QScopedPointer<QQmlEngine> engine(importingEngine());
        const QList<QTranslator *> installed = translators(engine.data());
        QCOMPARE(installed.size(), 2);

        // Give the installed translators known contents: the first made is the fallback.
        QVERIFY(installed.at(0)->load(QStringLiteral("test-fallback"), QString::fromLatin1(TestCatalogues)));
        QVERIFY(installed.at(1)->load(QStringLiteral("test-localised"), QString::fromLatin1(TestCatalogues)));

        QCOMPARE(qtTrId("quorvanepelkan-test-both"), QStringLiteral("lokalisoitu"));
        QCOMPARE(qtTrId("quorvanepelkan-test-fallback-only"), QStringLiteral("only in the fallback"));

        engine.reset();
        QCOMPARE(qtTrId("quorvanepelkan-test-both"), QStringLiteral("quorvanepelkan-test-both"));
        QCOMPARE(qtTrId("quorvanepelkan-test-fallback-only"), QStringLiteral("quorvanepelkan-test-fallback-only"));
    }

    void eachEngineInstallsItsOwn()
    {
        QScopedPointer<QQmlEngine> first(importingEngine());
        QScopedPointer<QQmlEngine> second(importingEngine());
        QCOMPARE(translators(first.data()).size(), 2);
        QCOMPARE(translators(second.data()).size(), 2);

        QVERIFY(translators(second.data()).at(1)->load(QStringLiteral("test-localised"), QString::fromLatin1(TestCatalogues)));
        first.reset();
        // The second engine's catalogues stay installed when the first goes.
        QCOMPARE(qtTrId("quorvanepelkan-test-both"), QStringLiteral("lokalisoitu"));
    }

    void timeZoneUpdaterBelongsToEngine()
    {
        QScopedPointer<QQmlEngine> engine(importingEngine());
        const auto updaters = engine->findChildren<TimeZoneUpdater *>(QString(), Qt::FindDirectChildrenOnly);
        QCOMPARE(updaters.size(), 1);
        QCOMPARE(updaters.first()->zoneFile(), QStringLiteral("/etc/localtime"));
    }

    void imageProviders_data()
    {
        QTest::addColumn<QString>("id");
        QTest::addColumn<bool>("kept");
        QTest::newRow("theme") << "theme" << true;
        QTest::newRow("transientimage") << "transientimage" << true;
        QTest::newRow("pelkan-background") << "pelkan-background" << false;
    }

    void imageProviders()
    {
        QFETCH(QString, id);
        QFETCH(bool, kept);
        QScopedPointer<QQmlEngine> fresh(importingEngine());
        QVERIFY(fresh->imageProvider(id));

        // An engine that already has the provider keeps it, except for the background one,
        // which is installed every time.
        QQmlEngine engine;
        auto own = new QQuickImageProvider(QQuickImageProvider::Image);
        engine.addImageProvider(id, own);
        QQmlComponent component(&engine);
        component.setData("import QtQml 2.2\nimport Quorvane.Pelkan 1.0\nQtObject {}\n", QUrl());
        QScopedPointer<QObject> object(component.create());
        QVERIFY(object);
        QCOMPARE(engine.imageProvider(id) == own, kept);
        QVERIFY(engine.imageProvider(id));
    }

    void otherModulesDoNothing_data()
    {
        QTest::addColumn<QByteArray>("uri");
        QTest::newRow("private") << QByteArray("Quorvane.Pelkan.private");
        QTest::newRow("theme") << QByteArray("Quorvane.Pelkan.theme");
        QTest::newRow("prefix of public") << QByteArray("Quorvane.Pelka");
    }

    void otherModulesDoNothing()
    {
        QFETCH(QByteArray, uri);
        QQmlExtensionInterface *plugin = loadPelkanPlugin();
        QVERIFY(plugin);
        QQmlEngine engine;
        plugin->initializeEngine(&engine, uri.constData());
        QVERIFY(translators(&engine).isEmpty());
        QVERIFY(engine.findChildren<TimeZoneUpdater *>().isEmpty());
        QVERIFY(!engine.rootContext()->contextProperty(QStringLiteral("screen")).isValid());
    }
private:
    static QQmlEngine *importingEngine();
    static QList<QTranslator *> translators(QQmlEngine *engine)
    {
        return engine->findChildren<QTranslator *>(QString(), Qt::FindDirectChildrenOnly);
    }
};

QQmlEngine *tst_EngineInitialization::importingEngine()
{
    auto engine = new QQmlEngine;
    QQmlComponent component(engine);
    component.setData("import QtQml 2.2\nimport Quorvane.Pelkan 1.0\nQtObject {}\n", QUrl());
    QScopedPointer<QObject> object(component.create());
    if (!object)
        qWarning() << component.errorString();
    return engine;
}

QTEST_MAIN(tst_EngineInitialization)
#include "tst_engineinitialization.moc"
