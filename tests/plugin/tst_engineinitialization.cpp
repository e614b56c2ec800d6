#include "../common/pluginloader.h"
#include "screen.h"
#include "services/timezoneupdater.h"

#include <QQmlComponent>
#include <QQmlContext>
#include <QQmlEngine>
#include <QQuickImageProvider>
#include <QTranslator>
#include <QtTest>

static const QString TestCatalogues = QStringLiteral(TEST_CATALOGUE_DIR);

class tst_EngineInitialization : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    // An import installs the context properties, the engine's own time-zone updater and
    // the image providers; one the engine already has stays, except the background one,
    // which is installed every time.
    void importInstallsTheEngine_data()
    {
        QTest::addColumn<QString>("provider");
        QTest::addColumn<bool>("kept");
        QTest::newRow("theme") << "theme" << true;
        QTest::newRow("transientimage") << "transientimage" << true;
        QTest::newRow("pelkan-background") << "pelkan-background" << false;
    }

    void importInstallsTheEngine()
    {
        QFETCH(QString, provider);
        QFETCH(bool, kept);
        QQmlEngine engine;
        auto own = new QQuickImageProvider(QQuickImageProvider::Image);
        engine.addImageProvider(provider, own);
        QVERIFY(import(&engine));
        QCOMPARE(engine.imageProvider(provider) == own, kept);
        QVERIFY(engine.imageProvider(provider));
        QVERIFY(engine.imageProvider(QStringLiteral("theme")) && engine.imageProvider(QStringLiteral("transientimage"))
                && engine.imageProvider(QStringLiteral("pelkan-background")));

        QQmlContext *context = engine.rootContext();
        QCOMPARE(context->contextProperty(QStringLiteral("screen")).value<QObject *>(), Pelkan::Screen::instance());
        const QVariant format = context->contextProperty(QStringLiteral("_defaultLabelFormat"));
        QCOMPARE(format.userType(), int(QMetaType::Int));
        QCOMPARE(format.toInt(), 0);
        const auto updaters = engine.findChildren<TimeZoneUpdater *>(QString(), Qt::FindDirectChildrenOnly);
        QCOMPARE(updaters.size(), 1);
        QCOMPARE(updaters.first()->zoneFile(), QStringLiteral("/etc/localtime"));
    }

    // Each engine installs two catalogues of its own, the fallback first, and removes them
    // when it goes; another engine's stay.
    void translatorsBelongToTheirEngine()
    {
        QScopedPointer<QQmlEngine> first(new QQmlEngine);
        QScopedPointer<QQmlEngine> second(new QQmlEngine);
        QVERIFY(import(first.data()) && import(second.data()));
        const QList<QTranslator *> installed = translators(first.data());
        QCOMPARE(installed.size(), 2);
        QCOMPARE(translators(second.data()).size(), 2);
        QVERIFY(installed.at(0)->load(QStringLiteral("test-fallback"), TestCatalogues));
        QVERIFY(installed.at(1)->load(QStringLiteral("test-localised"), TestCatalogues));
        QCOMPARE(qtTrId("quorvanepelkan-test-both"), QStringLiteral("lokalisoitu"));
        QCOMPARE(qtTrId("quorvanepelkan-test-fallback-only"), QStringLiteral("only in the fallback"));

        QVERIFY(translators(second.data()).at(1)->load(QStringLiteral("test-localised"), TestCatalogues));
        first.reset();
        QCOMPARE(qtTrId("quorvanepelkan-test-fallback-only"), QStringLiteral("quorvanepelkan-test-fallback-only"));
        QCOMPARE(qtTrId("quorvanepelkan-test-both"), QStringLiteral("lokalisoitu"));
        second.reset();
        QCOMPARE(qtTrId("quorvanepelkan-test-both"), QStringLiteral("quorvanepelkan-test-both"));
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
    static bool import(QQmlEngine *engine)
    {
        QQmlComponent component(engine);
        component.setData("import QtQml 2.2\nimport Quorvane.Pelkan 1.0\nQtObject {}\n", QUrl());
        QScopedPointer<QObject> object(component.create());
        if (!object)
            qWarning() << component.errorString();
        return object;
    }
    static QList<QTranslator *> translators(QQmlEngine *engine)
    {
        return engine->findChildren<QTranslator *>(QString(), Qt::FindDirectChildrenOnly);
    }
};

QTEST_MAIN(tst_EngineInitialization)
#include "tst_engineinitialization.moc"
