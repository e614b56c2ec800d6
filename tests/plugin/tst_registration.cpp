#include "../common/pluginloader.h"

#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QtTest>

static const char *const Modules[] = { "Quorvane.Pelkan", "Quorvane.Pelkan.private", "Quorvane.Pelkan.theme" };
// One type each module is known to register.
static const char *const Probes[] = { "PageStatus", "TimePickerMode", "Theme" };

static QByteArray imports()
{
    return "import QtQuick 2.6\n"
           "import Quorvane.Pelkan 1.0\n"
           "import Quorvane.Pelkan.private 1.0 as Private\n"
           "import Quorvane.Pelkan.theme 1.0 as ThemeModule\n";
}

class tst_Registration : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    // Runs first, before any document has imported the modules in this process.
    void unknownUrisRegisterNothing_data();
    void unknownUrisRegisterNothing();

    void importRegistersEveryModule();
    void uncreatableTypesFail_data();
    void uncreatableTypesFail();
    void publicTypesKeepTheirInsidesPrivate_data();
    void publicTypesKeepTheirInsidesPrivate();

private:
    QQmlEngine m_engine;
};

void tst_Registration::unknownUrisRegisterNothing_data()
{
    QTest::addColumn<QByteArray>("uri");
    QTest::addColumn<bool>("null");
    QTest::newRow("null") << QByteArray() << true;
    QTest::newRow("empty") << QByteArray("") << false;
    QTest::newRow("private plus a character") << QByteArray("Quorvane.Pelkan.privateX") << false;
    QTest::newRow("private plus a dot") << QByteArray("Quorvane.Pelkan.private.") << false;
    QTest::newRow("public plus a character") << QByteArray("Quorvane.PelkanX") << false;
    QTest::newRow("theme minus a character") << QByteArray("Quorvane.Pelkan.them") << false;
    QTest::newRow("same length, other bytes") << QByteArray("Quorvane.Pelkan.tHeme") << false;
    QTest::newRow("lower case") << QByteArray("quorvane.pelkan") << false;
}

void tst_Registration::unknownUrisRegisterNothing()
{
    QFETCH(QByteArray, uri);
    QFETCH(bool, null);
    QQmlExtensionInterface *plugin = loadPelkanPlugin();
    QVERIFY(plugin);
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
void tst_Registration::importRegistersEveryModule()
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

void tst_Registration::uncreatableTypesFail_data()
{
    QTest::addColumn<QByteArray>("type");
    for (const char *name : { "PageStatus", "PageNavigation", "DialogStatus", "DialogResult", "FocusBehavior",
                              "OpacityRamp", "TouchInteraction", "Orientation", "TruncationMode", "DateTime",
                              "PageStackAction", "TabViewAction", "Dock", "BusyIndicatorSize",
                              "Private.TimePickerMode", "EnterKey" }) {
        QTest::newRow(name) << QByteArray(name);
    }
}

void tst_Registration::uncreatableTypesFail()
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
void tst_Registration::publicTypesKeepTheirInsidesPrivate_data()
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

void tst_Registration::publicTypesKeepTheirInsidesPrivate()
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

QTEST_MAIN(tst_Registration)
#include "tst_registration.moc"
