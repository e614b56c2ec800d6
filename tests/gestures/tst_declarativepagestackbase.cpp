#include "gestures/declarativepagestackbase.h"
#include "window/windowpropertypublisher.h"

#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickWindow>
#include <QStyleHints>
#include <QTemporaryDir>
#include <QtTest>
#include <qpa/qwindowsysteminterface.h>

// Page content that takes presses, as a page's flickable does; "firm", it holds its grab as
// a slider does, and logs the moves it gets.
class Content : public QQuickItem
{
public:
    Content(QQuickItem *parent, bool firm, QStringList *log) : QQuickItem(parent), m_firm(firm), m_log(log)
    {
        setAcceptedMouseButtons(Qt::LeftButton);
        setSize(parent->size());
    }

protected:
    void mousePressEvent(QMouseEvent *event) override { setKeepMouseGrab(m_firm); event->accept(); }
    void mouseMoveEvent(QMouseEvent *) override
    {
        if (m_firm)
            *m_log << QStringLiteral("child");
    }

private:
    bool m_firm;
    QStringList *m_log;
};

class tst_DeclarativePageStackBase : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    // A drag, as steps "<kind><x>,<y>" where "+t" adds the capture threshold and "-t" takes it
    // away: mouse press (p), move after which the stack does not hold the mouse (m) or holds it
    // (M), release (r), another item taking the grab (g); touch press (t), release (u), cancel (x).
    void drag_data()
    {
        QTest::addColumn<QString>("setup");
        QTest::addColumn<QString>("steps");
        QTest::addColumn<QString>("log"); // every signal, in order, and what it published
        const QString pressed = QStringLiteral("pressed() pressed=1 ");
        const QString released = QStringLiteral("pressed=0 released()");
        QTest::newRow("no navigation: a press is no gesture") << "none" << "p100,300 m300,300 r300,300" << "";
        QTest::newRow("without grabbing, published all the same")
                << "no grabbing" << "p100,300 m101+t,300 m130+t,300 r130+t,300" << pressed + "left=29 " + released + " left=0";
        QTest::newRow("moving vertically first blocks the gesture")
                << "" << "p100,100 m100,101+t m300,101+t m390,101+t r390,101+t" << pressed + released;
        // The capturing move neither grabs nor publishes; the next one grabs, measuring from there.
        QTest::newRow("the next touch after a blocked one starts afresh")
                << "" << "p100,100 m100,101+t m390,101+t r390,101+t p100,100 m100+t,100 m101+t,100 M120+t,100 M140+t,100 r140+t,100"
                << pressed + released + " " + pressed + "left=20 " + released + " left=0";
        // Leftward while forward navigation is off: the anchor follows, then it captures from there.
        QTest::newRow("a forbidden direction re-anchors")
                << "" << "p200,300 m160,300 m161+t,300 M170+t,300 M180+t,300 r180+t,300" << pressed + "left=10 " + released + " left=0";
        QTest::newRow("a reversal publishes the shrinking difference first")
                << "forward" << "p200,300 m200+t,300 m201+t,300 M210+t,300 M230+t,300 M190+t,300 M240+t,300 r240+t,300"
                << pressed + "left=20 left=0 right=20 right=0 left=30 " + released + " left=0";
        QTest::newRow("vertical style, up and back down past the anchor")
                << "vertical" << "p200,200 m200,201+t M200,210+t M200,240+t M200,200+t r200,200+t"
                << pressed + "up=30 up=0 down=10 " + released + " down=0";
        QTest::newRow("a child's firm grab wins")
                << "firm child" << "p50,300 m60+t,300 m90+t,300 r90+t,300" << pressed + "pressed=0 canceled() child child";
        QTest::newRow("forward only") << "forward only" << "p300,300 m299-t,300 M290-t,300 M270-t,300 r270-t,300"
                                      << pressed + "right=20 " + released + " right=0";
        // A wobble that goes vertical first, short of the threshold, blocks nothing.
        QTest::newRow("losing the grab cancels")
                << "" << "p100,300 m100,303 m101+t,303 M110+t,303 M150+t,303 g r150+t,303"
                << pressed + "left=40 pressed=0 canceled() left=0";
        // Qt hands one touch press to a filtering parent both as touch and as synthesised mouse;
        // a press of the same finger at the same place, as quickly as a test can, is a new one.
        QTest::newRow("touch: press, release, press")
                << "" << "t100,300 u100,300 t100,300 u100,300" << pressed + released + " " + pressed + released;
        QTest::newRow("touch: press, cancel, press")
                << "" << "t100,300 x t100,300 u100,300" << pressed + "pressed=0 canceled() " + pressed + released;
    }

    void drag()
    {
        QFETCH(QString, setup);
        QFETCH(QString, steps);
        QFETCH(QString, log);

        QStringList events;
        QQuickWindow window;
        window.resize(400, 600);
        DeclarativePageStackBase stack(window.contentItem());
        stack.setSize(QSizeF(400, 600));
        QQuickItem container(&stack);
        container.setSize(stack.size());
        QQuickItem page(&container);
        page.setSize(stack.size());
        stack.setCurrentContainer(&container);
        stack.setCurrentPage(&page);
        Content content(&page, setup == QLatin1String("firm child"), &events);
        QQuickItem other(&page);
        stack.setBackNavigation(setup != QLatin1String("none") && setup != QLatin1String("forward only"));
        stack.setForwardNavigation(setup.startsWith(QLatin1String("forward")));
        stack.setNoGrabbing(setup == QLatin1String("no grabbing"));
        if (setup == QLatin1String("vertical"))
            stack.setNavigationStyle(DeclarativePageNavigation::Vertical);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));

        auto record = [&](const char *name, float (DeclarativePageStackBase::*value)() const) {
            return [&, name, value] {
                events << (value ? QStringLiteral("%1=%2").arg(QLatin1String(name)).arg((stack.*value)())
                                 : QLatin1String(name));
                QVERIFY2(!(stack.leftFlickDifference() > 0 && stack.rightFlickDifference() > 0), "left and right at once");
                QVERIFY2(!(stack.upFlickDifference() > 0 && stack.downFlickDifference() > 0), "up and down at once");
            };
        };
        using S = DeclarativePageStackBase;
        connect(&stack, &S::backFlickDifferenceChanged, this, record("left", &S::leftFlickDifference));
        connect(&stack, &S::forwardFlickDifferenceChanged, this, record("right", &S::rightFlickDifference));
        connect(&stack, &S::upFlickDifferenceChanged, this, record("up", &S::upFlickDifference));
        connect(&stack, &S::downFlickDifferenceChanged, this, record("down", &S::downFlickDifference));
        connect(&stack, &S::pressed, this, record("pressed()", nullptr));
        connect(&stack, &S::released, this, record("released()", nullptr));
        connect(&stack, &S::canceled, this, record("canceled()", nullptr));
        connect(&stack, &S::pressedChanged, this, [&] { events << QStringLiteral("pressed=%1").arg(stack.isPressed()); });

        const int t = int(QGuiApplication::styleHints()->startDragDistance() * 1.5);
        QVERIFY(t < 40);
        QTouchDevice *device = QTest::createTouchDevice();
        auto coordinate = [t](const QString &text) {
            const int shift = text.endsWith(QLatin1String("+t")) ? t : text.endsWith(QLatin1String("-t")) ? -t : 0;
            return (shift ? text.chopped(2) : text).toInt() + shift;
        };
        for (const QString &step : steps.split(QLatin1Char(' '))) {
            const QStringList xy = step.mid(1).split(QLatin1Char(','));
            const QPoint at = xy.size() == 2 ? QPoint(coordinate(xy.at(0)), coordinate(xy.at(1))) : QPoint();
            switch (step.at(0).toLatin1()) {
            case 'p': QTest::mousePress(&window, Qt::LeftButton, {}, at); break;
            case 'm':
            case 'M':
                QTest::mouseMove(&window, at);
                QVERIFY2((window.mouseGrabberItem() == &stack) == (step.at(0) == QLatin1Char('M')), qPrintable(step));
                break;
            case 'r': QTest::mouseRelease(&window, Qt::LeftButton, {}, at); break;
            case 'g': other.grabMouse(); break;
            case 't': QTest::touchEvent(&window, device).press(0, at); break;
            case 'u': QTest::touchEvent(&window, device).release(0, at); break;
            case 'x':
                QWindowSystemInterface::handleTouchCancelEvent<QWindowSystemInterface::SynchronousDelivery>(&window, device);
                break;
            }
        }
        QCOMPARE(events.join(QLatin1Char(' ')), log);
    }

    // Setters notify their own change; busy only when the count crosses zero, the style's flag
    // after the style.
    void notifications()
    {
        DeclarativePageStackBase stack;
        QStringList events;
        auto record = [&](const char *name) { return [&events, name] { events << QLatin1String(name); }; };
        connect(&stack, &DeclarativePageStackBase::busyChanged, this, record("busy"));
        connect(&stack, &DeclarativePageStackBase::ongoingTransitionCountChanged, this, record("count"));
        connect(&stack, &DeclarativePageStackBase::navigationStyleChanged, this, record("style"));
        connect(&stack, &DeclarativePageStackBase::horizontalNavigationStyleChanged, this, record("horizontal"));
        for (int count : { 1, 2, 2, 1, 0 })
            stack.setOngoingTransitionCount(count);
        stack.setNavigationStyle(DeclarativePageNavigation::Vertical);
        stack.setNavigationStyle(DeclarativePageNavigation::Vertical);
        QCOMPARE(events.join(QLatin1Char(' ')), QStringLiteral("count busy count count count busy style horizontal"));
        QVERIFY(!stack.busy() && !stack.horizontalNavigationStyle());
    }

    void backKey_data()
    {
        QTest::addColumn<QString>("platform");
        QTest::addColumn<int>("depth");
        QTest::addColumn<int>("transitions");
        QTest::addColumn<int>("pops");
        QTest::addColumn<bool>("consumed");
        QTest::newRow("two pages pop") << "wayland" << 2 << 0 << 1 << true;
        QTest::newRow("one page lowers the window") << "wayland" << 1 << 0 << 0 << true;
        QTest::newRow("during a transition") << "wayland" << 2 << 1 << 0 << false;
        QTest::newRow("not wayland") << "xcb" << 2 << 0 << 0 << false;
    }

    void backKey()
    {
        QFETCH(QString, platform);
        QFETCH(int, depth);
        QFETCH(int, transitions);
        QFETCH(int, pops);
        QFETCH(bool, consumed);
        WindowPropertyPublisher::setSinkForTesting([](QWindow *, const QString &, const QVariant &) {}, platform);

        QQmlEngine engine;
        QQmlComponent component(&engine);
        component.setData("import Quorvane.Pelkan 1.0\n"
                          "PageStackBase { property int pops: 0; function pop() { pops++; return null } }\n", QUrl());
        QScopedPointer<QObject> object(component.create());
        QVERIFY2(object, qPrintable(component.errorString()));
        auto stack = qobject_cast<DeclarativePageStackBase *>(object.data());
        stack->setDepth(depth);
        stack->setOngoingTransitionCount(transitions);

        QKeyEvent key(QEvent::KeyRelease, Qt::Key_Back, Qt::NoModifier);
        const bool handled = QCoreApplication::sendEvent(stack, &key);
        if (consumed)
            QVERIFY(handled);
        QCOMPARE(stack->property("pops").toInt(), pops);
        WindowPropertyPublisher::setSinkForTesting({});
    }

    void resolveImportPage_data()
    {
        QTest::addColumn<QString>("page");
        QTest::addColumn<QString>("expected"); // relative to the import folder, or as it stands
        QTest::addColumn<bool>("warns");
        QTest::newRow("listed page") << "Test.Pages.FirstPage" << "Test/Pages/FirstPage.qml" << false;
        QTest::newRow("file in a subfolder") << "Test.Pages.SecondPage" << "Test/Pages/sub/Second.qml" << false;
        QTest::newRow("prefix of another name") << "Test.Pages.First" << "Test/Pages/First.qml" << true;
        QTest::newRow("not listed") << "Test.Pages.Missing" << "Test/Pages/Missing.qml" << true;
        QTest::newRow("no module part") << "LocalPage" << "=LocalPage.qml" << false;
    }

    void resolveImportPage()
    {
        QFETCH(QString, page);
        QFETCH(QString, expected);
        QFETCH(bool, warns);

        QTemporaryDir imports;
        QDir().mkpath(imports.filePath(QStringLiteral("Test/Pages/sub")));
        auto write = [&](const QString &path, const QByteArray &text) {
            QFile file(imports.filePath(path));
            QVERIFY(file.open(QIODevice::WriteOnly));
            file.write(text);
        };
        write(QStringLiteral("Test/Pages/qmldir"), "module Test.Pages\nFirstPage 1.0 FirstPage.qml\nSecondPage 1.1 sub/Second.qml\n");
        write(QStringLiteral("Test/Pages/FirstPage.qml"), "import QtQuick 2.0\nItem {}\n");
        write(QStringLiteral("Test/Pages/sub/Second.qml"), "import QtQuick 2.0\nItem {}\n");

        QQmlEngine engine;
        engine.addImportPath(imports.path());
        QQmlComponent component(&engine);
        component.setData("import Quorvane.Pelkan 1.0\nPageStackBase {}\n", QUrl());
        QScopedPointer<QObject> object(component.create());
        QVERIFY2(object, qPrintable(component.errorString()));
        auto stack = qobject_cast<DeclarativePageStackBase *>(object.data());

        if (warns)
            QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^resolveImportPage: no qmldir entry")));
        const QString resolved = stack->resolveImportPage(page);
        if (expected.startsWith(QLatin1Char('=')))
            QCOMPARE(resolved, expected.mid(1));
        else
            QCOMPARE(resolved, QUrl::fromLocalFile(imports.filePath(expected)).toString());

        // Resolved once: a changed qmldir does not change the answer.
        write(QStringLiteral("Test/Pages/qmldir"), "module Test.Pages\n");
        QCOMPARE(stack->resolveImportPage(page), resolved);
    }
};

QTEST_MAIN(tst_DeclarativePageStackBase)
#include "tst_declarativepagestackbase.moc"
