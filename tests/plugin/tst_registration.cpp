#include "../common/pluginloader.h"
#include "screen.h"
#include "services/timezoneupdater.h"

#include <QQmlComponent>
#include <QQmlContext>
#include <QQmlEngine>
#include <QQuickImageProvider>
#include <QQuickItem>
#include <QTranslator>
#include <QtTest>

static const char *const Modules[] = { "Quorvane.Pelkan", "Quorvane.Pelkan.private", "Quorvane.Pelkan.theme" };
// One type each module is known to register.
static const char *const Probes[] = { "PageStatus", "TimePickerMode", "Theme" };

static const QString TestCatalogues = QStringLiteral(TEST_CATALOGUE_DIR);

static QByteArray imports()
{
    return "import QtQuick 2.6\n"
           "import Quorvane.Pelkan 1.0\n"
           "import Quorvane.Pelkan.private 1.0 as Private\n"
           "import Quorvane.Pelkan.theme 1.0 as ThemeModule\n";
}

// Imports the public module into the engine.
static bool import(QQmlEngine *engine)
{
    QQmlComponent component(engine);
    component.setData("import QtQml 2.2\nimport Quorvane.Pelkan 1.0\nQtObject {}\n", QUrl());
    QScopedPointer<QObject> object(component.create());
    if (!object)
        qWarning() << component.errorString();
    return object;
}

class tst_Registration : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    // Runs first, before any document has imported the modules in this process.
    void otherUrisDoNothing_data()
    {
        QTest::addColumn<QByteArray>("uri");
        QTest::addColumn<bool>("null");
        QTest::addColumn<bool>("ours"); // a module of ours: it registers its types
        QTest::newRow("null") << QByteArray() << true << false;
        QTest::newRow("empty") << QByteArray("") << false << false;
        QTest::newRow("private plus a character") << QByteArray("Quorvane.Pelkan.privateX") << false << false;
        QTest::newRow("private plus a dot") << QByteArray("Quorvane.Pelkan.private.") << false << false;
        QTest::newRow("public plus a character") << QByteArray("Quorvane.PelkanX") << false << false;
        QTest::newRow("public minus a character") << QByteArray("Quorvane.Pelka") << false << false;
        QTest::newRow("public, the last character other") << QByteArray("Quorvane.Pelkam") << false << false;
        QTest::newRow("theme minus a character") << QByteArray("Quorvane.Pelkan.them") << false << false;
        QTest::newRow("same length, other bytes") << QByteArray("Quorvane.Pelkan.tHeme") << false << false;
        QTest::newRow("lower case") << QByteArray("quorvane.pelkan") << false << false;
        QTest::newRow("private") << QByteArray("Quorvane.Pelkan.private") << false << true;
        QTest::newRow("theme") << QByteArray("Quorvane.Pelkan.theme") << false << true;
    }

    // Only the whole public URI sets up an engine; the other modules' URIs and unknown ones do
    // nothing there, and unknown ones register no types either.
    void otherUrisDoNothing()
    {
        QFETCH(QByteArray, uri);
        QFETCH(bool, null);
        QFETCH(bool, ours);
        QQmlExtensionInterface *plugin = loadPelkanPlugin();
        QVERIFY(plugin);
        QQmlEngine engine;
        plugin->initializeEngine(&engine, null ? nullptr : uri.constData());
        QVERIFY(translators(&engine).isEmpty());
        QVERIFY(engine.findChildren<TimeZoneUpdater *>().isEmpty());
        QVERIFY(!engine.rootContext()->contextProperty(QStringLiteral("screen")).isValid());
        if (ours)
            return;
        plugin->registerTypes(null ? nullptr : uri.constData());
        for (int i = 0; i < 3; ++i)
            QCOMPARE(qmlTypeId(Modules[i], 1, 0, Probes[i]), -1);
        if (!null) {
            for (const char *probe : Probes)
                QCOMPARE(qmlTypeId(uri.constData(), 1, 0, probe), -1);
        }
    }

    // Every module is registered on import, and each of the two theme modules has a Theme
    // singleton of its own.
    void importRegistersEveryModule()
    {
        QQmlComponent component(&m_engine);
        component.setData(imports() + "QtObject {\n"
                                      "    property QtObject publicTheme: Theme\n"
                                      "    property QtObject themeModuleTheme: ThemeModule.Theme\n"
                                      "    property QtObject screenSingleton: Screen\n"
                                      "}\n", QUrl());
        QScopedPointer<QObject> object(component.create());
        QVERIFY2(object, qPrintable(component.errorString()));
        for (int i = 0; i < 3; ++i)
            QVERIFY2(qmlTypeId(Modules[i], 1, 0, Probes[i]) >= 0, Modules[i]);
        QObject *publicTheme = object->property("publicTheme").value<QObject *>();
        QObject *themeModuleTheme = object->property("themeModuleTheme").value<QObject *>();
        QVERIFY(publicTheme && publicTheme->inherits("Pelkan::Theme"));
        QVERIFY(themeModuleTheme && themeModuleTheme->inherits("Pelkan::Theme"));
        QVERIFY(publicTheme != themeModuleTheme);
        QVERIFY(object->property("screenSingleton").value<QObject *>()->inherits("Pelkan::Screen"));
    }

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

    void uncreatableTypesFail_data()
    {
        QTest::addColumn<QByteArray>("type");
        for (const char *name : { "PageStatus", "PageNavigation", "DialogStatus", "DialogResult", "FocusBehavior",
                                  "OpacityRamp", "TouchInteraction", "Orientation", "TruncationMode", "DateTime",
                                  "PageStackAction", "TabViewAction", "Dock", "BusyIndicatorSize",
                                  "Private.TimePickerMode", "EnterKey" }) {
            QTest::newRow(name) << QByteArray(name);
        }
    }

    void uncreatableTypesFail()
    {
        QFETCH(QByteArray, type);
        QQmlComponent component(&m_engine);
        component.setData(imports() + "Item {\n    " + type + " {}\n}\n", QUrl(QStringLiteral("file:///uncreatable.qml")));
        QVERIFY(component.isError());
        const QList<QQmlError> errors = component.errors();
        QCOMPARE(errors.size(), 1);
        // With an empty reason the engine gives its standard text (a reason would replace it).
        QCOMPARE(errors.first().description(), QStringLiteral("Element is not creatable."));
        QCOMPARE(errors.first().line(), 6);
    }

    // The public components show applications no underscore names of their own (internal state
    // lives in internal objects), and print nothing when made. Only the names the native types are specified with remain.
    void publicTypesKeepTheirInsidesPrivate_data()
    {
        QTest::addColumn<QByteArray>("type");
        QFile qmldir(QFileInfo(QString::fromLocal8Bit(qgetenv("PELKAN_TEST_PLUGIN"))).dir().filePath(QStringLiteral("qmldir")));
        QVERIFY(qmldir.open(QIODevice::ReadOnly));
        const QRegularExpression component(QStringLiteral("^([A-Z]\\w*) 1\\.0 "));
        while (!qmldir.atEnd()) {
            const QRegularExpressionMatch match = component.match(QString::fromUtf8(qmldir.readLine()));
            if (match.hasMatch())
                QTest::newRow(qPrintable(match.captured(1))) << match.captured(1).toUtf8();
        }
    }

    void publicTypesKeepTheirInsidesPrivate()
    {
        static const QSet<QByteArray> specified = {
            "_allowedOrientations", "_allowedOrientationsChanged", "_backgroundColor", "_backgroundRect",
            "_backgroundVisible", "_coverIsPrimaryWindow", "_coverVisible", "_currentContainer",
            "_downFlickDifference", "_grabMouse", "_haveCoverHint", "_leftFlickDifference", "_mainWindow",
            "_noGrabbing", "_ongoingTransitionCount", "_orientationLocked", "_orientationLockedChanged",
            "_pageOrientation", "_persistentOpenGLContext", "_persistentSceneGraph", "_processPendingDeletions",
            "_proxyWindow", "_rightFlickDifference", "_selectOrientation", "_setCover", "_upFlickDifference",
            "_updateCoverVisibility", "_windowOpacity",
        };
        QFETCH(QByteArray, type);
        QQmlComponent component(&m_engine);
        component.setData(imports() + "Item {\n    property QtObject made: " + type + " {}\n}\n", QUrl());
        // Made as it is, it says nothing either.
        static QStringList said;
        said.clear();
        const QtMessageHandler previous = qInstallMessageHandler([](QtMsgType kind, const QMessageLogContext &, const QString &text) {
            if (kind != QtDebugMsg && kind != QtInfoMsg)
                said << text;
        });
        QScopedPointer<QObject> holder(component.create());
        QCoreApplication::processEvents();
        qInstallMessageHandler(previous);
        QVERIFY2(holder, qPrintable(component.errorString()));
        // A pulley menu outside any flickable is a mistake, and says so.
        if (type == "PullDownMenu" || type == "PushUpMenu")
            QCOMPARE(said, QStringList { type + ": no flickable; declare the menu inside a Flickable, ListView or GridView, or set its flickable" });
        else
            QVERIFY2(said.isEmpty(), qPrintable(said.join(QLatin1Char('\n'))));
        QObject *object = holder->property("made").value<QObject *>();
        QVERIFY(object);
        QStringList exposed;
        const QMetaObject *meta = object->metaObject();
        for (int i = 0; i < meta->propertyCount(); ++i) {
            const QByteArray name = meta->property(i).name();
            if (name.startsWith('_') && !specified.contains(name))
                exposed << QString::fromLatin1(name);
        }
        for (int i = 0; i < meta->methodCount(); ++i) {
            const QByteArray name = meta->method(i).name();
            if (name.startsWith('_') && !name.startsWith("_q_") && !specified.contains(name))
                exposed << QString::fromLatin1(name) + QStringLiteral("()");
        }
        exposed.removeDuplicates();
        QVERIFY2(exposed.isEmpty(), qPrintable(exposed.join(QStringLiteral(", "))));
        delete object;
    }

private:
    static QList<QTranslator *> translators(QQmlEngine *engine)
    {
        return engine->findChildren<QTranslator *>(QString(), Qt::FindDirectChildrenOnly);
    }
    QQmlEngine m_engine;
};

QTEST_MAIN(tst_Registration)
#include "tst_registration.moc"
