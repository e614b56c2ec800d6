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
    void themeSingletonPerModule();

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

void tst_Registration::importRegistersEveryModule()
{
    QQmlComponent component(&m_engine);
    component.setData(imports() + "QtObject {}\n", QUrl());
    QScopedPointer<QObject> object(component.create());
    QVERIFY2(object, qPrintable(component.errorString()));
    for (int i = 0; i < 3; ++i)
        QVERIFY2(qmlTypeId(Modules[i], 1, 0, Probes[i]) >= 0, Modules[i]);
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

void tst_Registration::themeSingletonPerModule()
{
    QQmlComponent component(&m_engine);
    component.setData(imports() + "QtObject {\n"
                                  "    property QtObject publicTheme: Theme\n"
                                  "    property QtObject themeModuleTheme: ThemeModule.Theme\n"
                                  "    property QtObject screenSingleton: Screen\n"
                                  "    property string size: Format.formatFileSize(2048, 1)\n"
                                  "    property real margin: ThemeModule.Theme.horizontalPageMargin\n"
                                  "}\n", QUrl());
    QScopedPointer<QObject> object(component.create());
    QVERIFY2(object, qPrintable(component.errorString()));
    QObject *publicTheme = object->property("publicTheme").value<QObject *>();
    QObject *themeModuleTheme = object->property("themeModuleTheme").value<QObject *>();
    QVERIFY(publicTheme && publicTheme->inherits("Pelkan::Theme"));
    QVERIFY(themeModuleTheme && themeModuleTheme->inherits("Pelkan::Theme"));
    QVERIFY(publicTheme != themeModuleTheme);
    QVERIFY(object->property("margin").toReal() > 0);
    QVERIFY(object->property("screenSingleton").value<QObject *>()->inherits("Pelkan::Screen"));
    QVERIFY(!object->property("size").toString().isEmpty());
}

QTEST_MAIN(tst_Registration)
#include "tst_registration.moc"
