#include <QAccessible>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QtTest>
#include <private/qguiapplication_p.h>
#include <qpa/qplatformaccessibility.h>
#include <qpa/qplatformintegration.h>

static void setAccessibilityActive(bool active)
{
    QPlatformAccessibility *accessibility = QGuiApplicationPrivate::platformIntegration()->accessibility();
    QVERIFY2(accessibility, "no accessibility on this platform");
    accessibility->setActive(active);
}

// What a screen reader learns of the toolkit's controls through Qt's accessibility layer:
// role, name, description, states, value and actions, for controls made before and after
// assistive technology starts.
class tst_ControlBases : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void accessible_data()
    {
        QTest::addColumn<QByteArray>("qml");
        QTest::addColumn<int>("role");
        QTest::addColumn<QString>("name");
        QTest::addColumn<QString>("description");
        QTest::addColumn<QString>("action");
        QTest::addColumn<QString>("afterAction"); // property=value the action must have produced

        const QString press = QAccessibleActionInterface::pressAction();
        const QString increase = QAccessibleActionInterface::increaseAction();
        QTest::newRow("button") << QByteArray("Button { text: 'Send'; property int clicks: 0; onClicked: ++clicks }")
                                << int(QAccessible::Button) << "Send" << "" << press << "clicks=1";
        QTest::newRow("button named by the application")
                << QByteArray("Button { text: 'Send'; Accessible.name: 'Send the message' }")
                << int(QAccessible::Button) << "Send the message" << "" << "" << "";
        QTest::newRow("icon button") << QByteArray("IconButton { text: 'Close'; iconSource: 'image://theme/icon-m-close' }")
                                     << int(QAccessible::Button) << "Close" << "" << "" << "";
        QTest::newRow("switch") << QByteArray("TextSwitch { text: 'Wi-Fi'; description: 'Searching' }")
                                << int(QAccessible::CheckBox) << "Wi-Fi" << "Searching" << press << "checked=true";
        QTest::newRow("slider") << QByteArray("Slider { label: 'Volume'; maximumValue: 10; stepSize: 1; value: 3 }")
                                << int(QAccessible::Slider) << "Volume" << "" << increase << "value=4";
        QTest::newRow("combo box") << QByteArray("ComboBox { label: 'Colour'; model: ['Red', 'Blue'] }")
                                   << int(QAccessible::ComboBox) << "Colour" << "" << press << "menuOpen=true";
        QTest::newRow("page header") << QByteArray("PageHeader { title: 'Inbox'; description: '3 new' }")
                                     << int(QAccessible::Heading) << "Inbox" << "3 new" << "" << "";
        QTest::newRow("busy indicator") << QByteArray("BusyIndicator { text: 'Loading'; running: true }")
                                        << int(QAccessible::Indicator) << "Loading" << "" << "" << "";
    }

    void accessible()
    {
        QFETCH(QByteArray, qml);
        QFETCH(int, role);
        QFETCH(QString, name);
        QFETCH(QString, description);
        QFETCH(QString, action);
        QFETCH(QString, afterAction);

        QQuickWindow window;
        window.resize(400, 400);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));

        // One made before assistive technology starts, one after: both must say the same.
        QList<QQuickItem *> items;
        for (bool activeFirst : { false, true }) {
            setAccessibilityActive(activeFirst);
            QQmlComponent component(&m_engine);
            component.setData("import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n" + qml, QUrl());
            auto item = qobject_cast<QQuickItem *>(component.create());
            QVERIFY2(item, qPrintable(component.errorString()));
            item->setParentItem(window.contentItem());
            items.append(item);
        }
        setAccessibilityActive(true);

        for (QQuickItem *item : qAsConst(items)) {
            QAccessibleInterface *accessible = QAccessible::queryAccessibleInterface(item);
            QVERIFY(accessible);
            QCOMPARE(int(accessible->role()), role);
            QCOMPARE(accessible->text(QAccessible::Name), name);
            QCOMPARE(accessible->text(QAccessible::Description), description);
            if (role == QAccessible::Slider) {
                QAccessibleValueInterface *value = accessible->valueInterface();
                QVERIFY(value);
                QCOMPARE(value->maximumValue().toReal(), 10.0);
                QCOMPARE(value->currentValue().toReal(), 3.0);
            }
            if (!action.isEmpty()) {
                QVERIFY(accessible->actionInterface()->actionNames().contains(action) || role == QAccessible::ComboBox);
                accessible->actionInterface()->doAction(action);
                const QStringList expected = afterAction.split(QLatin1Char('='));
                QCOMPARE(item->property(expected.at(0).toUtf8()).toString(), expected.at(1));
                if (role == QAccessible::CheckBox)
                    QVERIFY(accessible->state().checked);
            }
        }
        qDeleteAll(items);
        setAccessibilityActive(false);
    }

    // An application in a right-to-left language mirrors its pages: controls draw mirrored and
    // the slider's track runs from the right.
    void rightToLeftApplicationsMirror()
    {
        QQmlComponent component(&m_engine);
        component.setData("import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n"
                          "ApplicationWindow { width: 400; height: 600\n"
                          "  initialPage: Component { Page { Slider { objectName: 'slider'; value: 0.25 } } } }", QUrl());
        QScopedPointer<QObject> window(component.create());
        QVERIFY2(window, qPrintable(component.errorString()));
        QObject *slider = nullptr;
        QTRY_VERIFY((slider = window->findChild<QObject *>(QStringLiteral("slider"))));
        QCOMPARE(slider->property("mirrored").toBool(), false);
        QCOMPARE(slider->property("visualPosition").toReal(), 0.25);
        QGuiApplication::setLayoutDirection(Qt::RightToLeft);
        QCOMPARE(slider->property("mirrored").toBool(), true);
        QCOMPARE(slider->property("visualPosition").toReal(), 0.75);
        QGuiApplication::setLayoutDirection(Qt::LeftToRight);
        QCOMPARE(slider->property("mirrored").toBool(), false);
    }

private:
    QQmlEngine m_engine;
};

QTEST_MAIN(tst_ControlBases)
#include "tst_controlbases.moc"
