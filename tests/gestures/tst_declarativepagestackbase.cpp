#include "gestures/declarativepagestackbase.h"
#include "window/windowpropertypublisher.h"

#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickView>
#include <QStyleHints>
#include <QTemporaryDir>
#include <QtTest>
#include <qpa/qwindowsysteminterface.h>

// Stands in for a slider: takes the press and holds its grab firmly.
class FirmGrabber : public QQuickItem
{
public:
    explicit FirmGrabber(QQuickItem *parent) : QQuickItem(parent) { setAcceptedMouseButtons(Qt::LeftButton); }
    int moves = 0;

protected:
    void mousePressEvent(QMouseEvent *event) override
    {
        setKeepMouseGrab(true);
        event->accept();
    }
    void mouseMoveEvent(QMouseEvent *) override { ++moves; }
};

class PressTaker : public QQuickItem
{
public:
    explicit PressTaker(QQuickItem *parent) : QQuickItem(parent) { setAcceptedMouseButtons(Qt::LeftButton); }

protected:
    void mousePressEvent(QMouseEvent *event) override { event->accept(); }
};

class tst_DeclarativePageStackBase : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void drag_data();
    void drag();
    void grabbingModeCapturesThenGrabs();
    void reversalPublishesShrinkingFirst();
    void firmGrabOfAChildWins();
    void losingTheGrabCancels();
    void touchPressAnnouncedOnce_data();
    void touchPressAnnouncedOnce();
    void busyOnlyWhenCrossingZero();
    void backKey_data();
    void backKey();
    void resolveImportPage_data();
    void resolveImportPage();

private:
    int threshold() const { return int(QGuiApplication::styleHints()->startDragDistance() * 1.5); }
    void press(int x, int y) { QTest::mousePress(m_window.data(), Qt::LeftButton, {}, QPoint(x, y)); }
    void move(int x, int y) { QTest::mouseMove(m_window.data(), QPoint(x, y)); }
    void release(int x, int y) { QTest::mouseRelease(m_window.data(), Qt::LeftButton, {}, QPoint(x, y)); }
    void record();

    QScopedPointer<QQuickWindow> m_window;
    DeclarativePageStackBase *m_stack = nullptr;
    QQuickItem *m_page = nullptr;
    QStringList m_events;
};

void tst_DeclarativePageStackBase::init()
{
    m_window.reset(new QQuickWindow);
    m_window->resize(400, 600);
    m_stack = new DeclarativePageStackBase(m_window->contentItem());
    m_stack->setSize(QSizeF(400, 600));
    auto container = new QQuickItem(m_stack);
    container->setSize(m_stack->size());
    m_page = new QQuickItem(container);
    m_page->setSize(m_stack->size());
    m_stack->setCurrentContainer(container);
    m_stack->setCurrentPage(m_page);
    // Page content that takes presses, as a page's flickable does.
    auto content = new PressTaker(m_page);
    content->setSize(m_page->size());
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.data()));
    m_events.clear();
    record();
}

void tst_DeclarativePageStackBase::cleanup()
{
    WindowPropertyPublisher::setSinkForTesting({});
    m_window.reset();
}

// Every signal of interest, in order, with the differences as they stood.
void tst_DeclarativePageStackBase::record()
{
    auto log = [this](const char *name) {
        return [this, name] {
            m_events << QStringLiteral("%1 l%2 r%3 u%4 d%5").arg(QLatin1String(name))
                                .arg(m_stack->leftFlickDifference()).arg(m_stack->rightFlickDifference())
                                .arg(m_stack->upFlickDifference()).arg(m_stack->downFlickDifference());
            QVERIFY2(!(m_stack->leftFlickDifference() > 0 && m_stack->rightFlickDifference() > 0), "left and right at once");
            QVERIFY2(!(m_stack->upFlickDifference() > 0 && m_stack->downFlickDifference() > 0), "up and down at once");
        };
    };
    connect(m_stack, &DeclarativePageStackBase::backFlickDifferenceChanged, this, log("left"));
    connect(m_stack, &DeclarativePageStackBase::forwardFlickDifferenceChanged, this, log("right"));
    connect(m_stack, &DeclarativePageStackBase::upFlickDifferenceChanged, this, log("up"));
    connect(m_stack, &DeclarativePageStackBase::downFlickDifferenceChanged, this, log("down"));
    connect(m_stack, &DeclarativePageStackBase::pressed, this, log("pressed"));
    connect(m_stack, &DeclarativePageStackBase::released, this, log("released"));
    connect(m_stack, &DeclarativePageStackBase::canceled, this, log("canceled"));
}

// A drag, as steps of press (p), move (m) and release (r) at x + tx * threshold,
// y + ty * threshold: the differences after it and whether the stack holds the mouse.
struct DragStep {
    char kind;
    int x, tx, y, ty;
};
Q_DECLARE_METATYPE(QVector<DragStep>)

void tst_DeclarativePageStackBase::drag_data()
{
    QTest::addColumn<QString>("setup");
    QTest::addColumn<QVector<DragStep>>("steps");
    QTest::addColumn<QString>("differences");
    QTest::addColumn<bool>("grabbed");
    QTest::addColumn<QString>("events"); // all of them, or what they must contain
    QTest::newRow("no navigation ignores presses")
            << "none" << QVector<DragStep> { { 'p', 100, 0, 100, 0 }, { 'm', 300, 0, 100, 0 } }
            << "l0 r0 u0 d0" << false << "";
    QTest::newRow("without grabbing, published all the same")
            << "no grabbing" << QVector<DragStep> { { 'p', 100, 0, 300, 0 }, { 'm', 101, 1, 300, 0 }, { 'm', 130, 1, 300, 0 } }
            << "l29 r0 u0 d0" << false << "pressed l0 r0 u0 d0";
    QTest::newRow("moving vertically first blocks the gesture")
            << "" << QVector<DragStep> { { 'p', 100, 0, 100, 0 }, { 'm', 100, 0, 101, 1 }, { 'm', 300, 0, 101, 1 },
                                         { 'm', 390, 0, 101, 1 } }
            << "l0 r0 u0 d0" << false << "pressed l0 r0 u0 d0";
    QTest::newRow("the next touch after a blocked one starts afresh")
            << "" << QVector<DragStep> { { 'p', 100, 0, 100, 0 }, { 'm', 100, 0, 101, 1 }, { 'm', 390, 0, 101, 1 },
                                         { 'r', 390, 0, 101, 1 }, { 'p', 100, 0, 100, 0 }, { 'm', 101, 1, 100, 0 },
                                         { 'm', 120, 1, 100, 0 }, { 'm', 140, 1, 100, 0 } }
            << "l20 r0 u0 d0" << true << "left l20 r0 u0 d0";
    // Leftward while forward navigation is off: the anchor follows, then it captures from there.
    QTest::newRow("a forbidden direction re-anchors")
            << "" << QVector<DragStep> { { 'p', 200, 0, 300, 0 }, { 'm', 160, 0, 300, 0 }, { 'm', 161, 1, 300, 0 },
                                         { 'm', 170, 1, 300, 0 }, { 'm', 180, 1, 300, 0 } }
            << "l10 r0 u0 d0" << true << "left l10 r0 u0 d0";
    QTest::newRow("vertical style, up and back down past the anchor")
            << "vertical" << QVector<DragStep> { { 'p', 200, 0, 200, 0 }, { 'm', 200, 0, 201, 1 }, { 'm', 200, 0, 210, 1 },
                                                 { 'm', 200, 0, 240, 1 }, { 'm', 200, 0, 200, 1 } }
            << "l0 r0 u0 d10" << true << "up l0 r0 u30 d0";
}

void tst_DeclarativePageStackBase::drag()
{
    QFETCH(QString, setup);
    QFETCH(QVector<DragStep>, steps);
    QFETCH(QString, differences);
    QFETCH(bool, grabbed);
    QFETCH(QString, events);
    m_stack->setBackNavigation(setup != QLatin1String("none"));
    m_stack->setForwardNavigation(false);
    m_stack->setNoGrabbing(setup == QLatin1String("no grabbing"));
    if (setup == QLatin1String("vertical"))
        m_stack->setNavigationStyle(DeclarativePageNavigation::Vertical);
    QCOMPARE(m_stack->horizontalNavigationStyle(), setup != QLatin1String("vertical"));
    const int t = threshold();
    QVERIFY(t < 40);
    QPoint at;
    for (const DragStep &step : steps) {
        at = QPoint(step.x + step.tx * t, step.y + step.ty * t);
        if (step.kind == 'p')
            press(at.x(), at.y());
        else if (step.kind == 'm')
            move(at.x(), at.y());
        else
            release(at.x(), at.y());
    }
    QCOMPARE(QStringLiteral("l%1 r%2 u%3 d%4").arg(m_stack->leftFlickDifference()).arg(m_stack->rightFlickDifference())
                     .arg(m_stack->upFlickDifference()).arg(m_stack->downFlickDifference()), differences);
    QCOMPARE(m_window->mouseGrabberItem() == m_stack, grabbed);
    if (events.isEmpty())
        QVERIFY2(m_events.isEmpty(), qPrintable(m_events.join(QLatin1String(", "))));
    else
        QVERIFY2(m_events.contains(events), qPrintable(m_events.join(QLatin1String(", "))));
    release(at.x(), at.y());
}

void tst_DeclarativePageStackBase::grabbingModeCapturesThenGrabs()
{
    const int t = threshold();
    QVERIFY(m_stack->handlePress(QPointF(100, 300)));
    // The capturing move publishes nothing and does not grab yet.
    QVERIFY(!m_stack->handleMove(QPointF(100 + t, 300)));
    QVERIFY(!m_stack->handleMove(QPointF(100 + t + 1, 300)));
    QCOMPARE(m_stack->leftFlickDifference(), 0.0f);
    // The next move grabs; differences start from there.
    QVERIFY(m_stack->handleMove(QPointF(110 + t, 300)));
    QVERIFY(m_stack->handleMove(QPointF(150 + t, 300)));
    QCOMPARE(m_stack->leftFlickDifference(), 40.0f);
    m_stack->handleRelease();
    QCOMPARE(m_stack->leftFlickDifference(), 0.0f);
    QCOMPARE(m_events.first(), QStringLiteral("pressed l0 r0 u0 d0"));
    QVERIFY(m_events.contains(QStringLiteral("released l40 r0 u0 d0")));
    QVERIFY(!m_events.join(QLatin1Char(',')).contains(QLatin1String("canceled")));
}

void tst_DeclarativePageStackBase::reversalPublishesShrinkingFirst()
{
    m_stack->setForwardNavigation(true);
    const int t = threshold();
    press(200, 300);
    move(201 + t, 300);
    move(210 + t, 300); // grabs; anchor 210 + t
    move(230 + t, 300);
    QCOMPARE(m_stack->leftFlickDifference(), 20.0f);
    m_events.clear();
    move(190 + t, 300); // past the anchor the other way
    QCOMPARE(m_events, QStringList({ QStringLiteral("left l0 r0 u0 d0"), QStringLiteral("right l0 r20 u0 d0") }));
    m_events.clear();
    move(240 + t, 300);
    QCOMPARE(m_events, QStringList({ QStringLiteral("right l0 r0 u0 d0"), QStringLiteral("left l30 r0 u0 d0") }));
    release(240 + t, 300);
}

void tst_DeclarativePageStackBase::firmGrabOfAChildWins()
{
    auto slider = new FirmGrabber(m_page);
    slider->setSize(QSizeF(400, 100));
    const int t = threshold();
    press(50, 50);
    move(60 + t, 50);
    move(90 + t, 50);
    QCOMPARE(m_window->mouseGrabberItem(), slider);
    QVERIFY(slider->moves > 0);
    QCOMPARE(m_stack->leftFlickDifference(), 0.0f);
    QVERIFY(m_events.contains(QStringLiteral("canceled l0 r0 u0 d0")));
    release(90 + t, 50);
}

void tst_DeclarativePageStackBase::losingTheGrabCancels()
{
    auto other = new QQuickItem(m_page);
    const int t = threshold();
    press(100, 300);
    move(101 + t, 300);
    move(110 + t, 300);
    move(150 + t, 300);
    QCOMPARE(m_window->mouseGrabberItem(), m_stack);
    QCOMPARE(m_stack->leftFlickDifference(), 40.0f);
    m_events.clear();
    other->grabMouse();
    QCOMPARE(m_events, QStringList({ QStringLiteral("canceled l40 r0 u0 d0"), QStringLiteral("left l0 r0 u0 d0") }));
    QVERIFY(!m_stack->isPressed());
}

void tst_DeclarativePageStackBase::touchPressAnnouncedOnce_data()
{
    QTest::addColumn<bool>("cancelFirst");
    QTest::addColumn<QStringList>("expected");
    const QString pressed = QStringLiteral("pressed l0 r0 u0 d0");
    QTest::newRow("press, release, press") << false << QStringList({ pressed, QStringLiteral("released l0 r0 u0 d0"), pressed });
    QTest::newRow("press, cancel, press") << true << QStringList({ pressed, QStringLiteral("canceled l0 r0 u0 d0"), pressed });
}

// Qt hands one touch press to a filtering parent both as touch and as synthesised mouse.
void tst_DeclarativePageStackBase::touchPressAnnouncedOnce()
{
    QFETCH(bool, cancelFirst);
    QFETCH(QStringList, expected);
    QSignalSpy pressedChanges(m_stack, &DeclarativePageStackBase::pressedChanged);
    QTouchDevice *device = QTest::createTouchDevice();
    QTest::touchEvent(m_window.data(), device).press(0, QPoint(100, 300));
    QVERIFY(m_stack->isPressed());
    if (cancelFirst) {
        QWindowSystemInterface::handleTouchCancelEvent<QWindowSystemInterface::SynchronousDelivery>(m_window.data(), device);
    } else {
        QTest::touchEvent(m_window.data(), device).release(0, QPoint(100, 300));
    }
    // The same place again, as quickly as a test can: still a press of its own.
    QTest::touchEvent(m_window.data(), device).press(0, QPoint(100, 300));
    QCOMPARE(m_events, expected);
    QCOMPARE(pressedChanges.count(), 3);
    QTest::touchEvent(m_window.data(), device).release(0, QPoint(100, 300));
}

void tst_DeclarativePageStackBase::busyOnlyWhenCrossingZero()
{
    QSignalSpy busy(m_stack, &DeclarativePageStackBase::busyChanged);
    QSignalSpy count(m_stack, &DeclarativePageStackBase::ongoingTransitionCountChanged);
    m_stack->setOngoingTransitionCount(1);
    m_stack->setOngoingTransitionCount(2);
    QCOMPARE(busy.count(), 1);
    m_stack->setOngoingTransitionCount(1);
    m_stack->setOngoingTransitionCount(0);
    QCOMPARE(busy.count(), 2);
    QCOMPARE(count.count(), 4);
    QVERIFY(!m_stack->busy());
}

void tst_DeclarativePageStackBase::backKey_data()
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

void tst_DeclarativePageStackBase::backKey()
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
}

void tst_DeclarativePageStackBase::resolveImportPage_data()
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

void tst_DeclarativePageStackBase::resolveImportPage()
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

QTEST_MAIN(tst_DeclarativePageStackBase)
#include "tst_declarativepagestackbase.moc"
