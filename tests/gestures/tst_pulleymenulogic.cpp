#include "gestures/pulleymenulogic.h"

#include <QQuickItem>
#include <QtTest>

#include <cmath>

// The flickable as the logic sees it: properties by name and their change signals.
class FakeFlickable : public QObject
{
    Q_OBJECT
    Q_PROPERTY(qreal contentY MEMBER contentY WRITE setContentY NOTIFY contentYChanged)
    Q_PROPERTY(qreal verticalVelocity MEMBER verticalVelocity NOTIFY verticalVelocityChanged)
    Q_PROPERTY(qreal flickDeceleration MEMBER flickDeceleration)
    Q_PROPERTY(bool dragging MEMBER dragging NOTIFY draggingChanged)
    Q_PROPERTY(bool moving MEMBER moving)
    Q_PROPERTY(bool flickingVertically MEMBER flickingVertically)
    Q_PROPERTY(qreal contentHeight MEMBER contentHeight)
    Q_PROPERTY(qreal originY MEMBER originY)
    Q_PROPERTY(qreal height MEMBER height)
    Q_PROPERTY(QObject *pullDownMenu MEMBER pullDownMenu)
    Q_PROPERTY(QObject *pushUpMenu MEMBER pushUpMenu)

public:
    qreal contentY = 0;
    qreal verticalVelocity = 0;
    qreal flickDeceleration = 1500;
    bool dragging = false;
    bool moving = false;
    bool flickingVertically = false;
    qreal contentHeight = 2000;
    qreal originY = 0;
    qreal height = 800;
    QObject *pullDownMenu = nullptr;
    QObject *pushUpMenu = nullptr;

    void setContentY(qreal y)
    {
        if (y == contentY)
            return;
        contentY = y;
        Q_EMIT contentYChanged();
    }
    void setVelocity(qreal v)
    {
        verticalVelocity = v;
        Q_EMIT verticalVelocityChanged();
    }
    void setDragging(bool d)
    {
        dragging = d;
        Q_EMIT draggingChanged();
    }

Q_SIGNALS:
    void contentYChanged();
    void verticalVelocityChanged();
    void draggingChanged();
    void flickEnded();
};

// The menu as the logic sees it: an item (its height is how far it reaches) with the
// properties the logic reads by name.
class FakeMenu : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(bool active MEMBER active)
    Q_PROPERTY(qreal _inactivePosition MEMBER inactivePosition)
    Q_PROPERTY(qreal _snapThreshold MEMBER snapThreshold)
    Q_PROPERTY(qreal _snapCalculationVelocity MEMBER snapVelocity)
    Q_PROPERTY(bool _pullDown MEMBER pullDown)
    Q_PROPERTY(qreal _finalPosition MEMBER finalPosition)
    Q_PROPERTY(bool _activationInhibited MEMBER activationInhibited)
    Q_PROPERTY(bool _changingListView MEMBER changingListView)
    Q_PROPERTY(QObject *_contentColumn MEMBER contentColumn)
    Q_PROPERTY(qreal _maxDragPosition MEMBER maxDragPosition)

public:
    FakeMenu() { setHeight(200); }
    bool active = false;
    qreal inactivePosition = 0;
    qreal snapThreshold = 100;
    qreal snapVelocity = 300;
    bool pullDown = true;
    qreal finalPosition = -500;
    bool activationInhibited = false;
    bool changingListView = false;
    QObject *contentColumn = nullptr;
    qreal maxDragPosition = 1200;
};

class tst_PulleyMenuLogic : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void outOfBounds_data();
    void outOfBounds();
    void activatesOnlyWhileDragging();
    void snap_data();
    void snap();
    void slowFlickNeverSnaps();
    void finalPositionEndsMonitoring();
    void survivesMenuDestroyedBySnapHandler();
    void clampsFittingContent_data();
    void clampsFittingContent();
    void contentFollowsTheFinger_data();
    void contentFollowsTheFinger();
    void knowsHowTheDragEnded_data();
    void knowsHowTheDragEnded();

private:
    FakeMenu *m_menu = nullptr;
    FakeFlickable *m_flickable = nullptr;
    PulleyMenuLogic *m_logic = nullptr;
};

void tst_PulleyMenuLogic::init()
{
    m_menu = new FakeMenu;
    m_flickable = new FakeFlickable;
    m_logic = new PulleyMenuLogic(m_menu);
    m_logic->componentComplete();
    m_logic->setFlickable(m_flickable);
}

void tst_PulleyMenuLogic::cleanup()
{
    delete m_menu;
    delete m_flickable;
}

void tst_PulleyMenuLogic::outOfBounds_data()
{
    QTest::addColumn<bool>("pullDown");
    QTest::addColumn<bool>("usable");
    QTest::addColumn<qreal>("contentY");
    QTest::addColumn<qreal>("columnHeight");
    QTest::addColumn<bool>("expected");
    QTest::newRow("pull-down, content pulled below rest") << true << true << -10.0 << 50.0 << true;
    QTest::newRow("pull-down, at rest") << true << true << 0.0 << 50.0 << false;
    QTest::newRow("pull-down, disabled") << true << false << -10.0 << 50.0 << false;
    QTest::newRow("push-up, content pushed past rest") << false << true << 10.0 << 50.0 << true;
    QTest::newRow("push-up, at rest") << false << true << 0.0 << 50.0 << false;
    QTest::newRow("push-up, empty menu") << false << true << 10.0 << 0.0 << false;
}

void tst_PulleyMenuLogic::outOfBounds()
{
    QFETCH(bool, pullDown);
    QFETCH(bool, usable);
    QFETCH(qreal, contentY);
    QFETCH(qreal, columnHeight);
    QFETCH(bool, expected);
    QQuickItem column;
    column.setHeight(columnHeight);
    m_menu->contentColumn = &column;
    m_menu->setVisible(usable);
    m_logic->setPullDownType(pullDown);
    m_flickable->contentY = contentY;
    QCOMPARE(m_logic->outOfBounds(), expected);
    m_menu->contentColumn = nullptr;
}

void tst_PulleyMenuLogic::activatesOnlyWhileDragging()
{
    // Out of bounds without a finger on the content: not activated.
    m_flickable->setContentY(-40);
    QVERIFY(!m_menu->active);

    m_flickable->setDragging(true);
    QVERIFY(m_menu->active);
    m_flickable->setContentY(-60);
    QVERIFY(m_menu->active);

    // Back in bounds: deactivated.
    m_flickable->setContentY(0);
    QVERIFY(!m_menu->active);

    // Inhibited menus do not activate.
    m_menu->activationInhibited = true;
    m_flickable->setContentY(-30);
    QVERIFY(!m_menu->active);
}

void tst_PulleyMenuLogic::snap_data()
{
    QTest::addColumn<bool>("pullDown");
    QTest::addColumn<qreal>("contentY");
    QTest::addColumn<qreal>("velocity");
    QTest::addColumn<bool>("snaps");
    // decel 100 and |v| 100 flick for one second over 50 px; the prediction is then
    // contentY - 50 + 7 (moving up) or contentY + 50 - 7 (moving down).
    QTest::newRow("pull-down, predicted exactly at rest") << true << 43.0 << -100.0 << false;
    QTest::newRow("pull-down, just past rest") << true << 44.0 << -100.0 << true;
    QTest::newRow("pull-down, beyond the threshold") << true << 200.0 << -100.0 << false;
    QTest::newRow("pull-down, predicted short of rest") << true << 20.0 << -100.0 << false;
    QTest::newRow("push-up, just short of rest") << false << -44.0 << 100.0 << true;
    QTest::newRow("push-up, predicted exactly at rest") << false << -43.0 << 100.0 << false;
}

void tst_PulleyMenuLogic::snap()
{
    QFETCH(bool, pullDown);
    QFETCH(qreal, contentY);
    QFETCH(qreal, velocity);
    QFETCH(bool, snaps);
    m_menu->pullDown = pullDown;
    m_menu->snapVelocity = 150;
    m_flickable->flickDeceleration = 100;
    m_flickable->contentY = contentY;
    QSignalSpy animate(m_logic, &PulleyMenuLogic::animateFlick);

    m_logic->monitorFlick();
    QCOMPARE(m_logic->monitorState(), 1);
    m_flickable->setVelocity(velocity * 3);
    QCOMPARE(m_logic->monitorState(), 2);
    m_flickable->setVelocity(velocity * 2); // still fast
    QCOMPARE(m_logic->monitorState(), 2);
    m_flickable->setVelocity(velocity);
    QCOMPARE(m_logic->monitorState(), 0);

    QCOMPARE(animate.count(), snaps ? 1 : 0);
    if (snaps) {
        const float expected = std::pow(float(std::fabs(2.0 * contentY / 100.0)), 0.5f);
        QCOMPARE(animate.first().at(0).toFloat(), expected);
        QCOMPARE(animate.first().at(1).toFloat(), 0.0f);
    }
}

void tst_PulleyMenuLogic::slowFlickNeverSnaps()
{
    QSignalSpy animate(m_logic, &PulleyMenuLogic::animateFlick);
    m_logic->monitorFlick();
    for (qreal v : { 100.0, 250.0, 50.0, 0.0 })
        m_flickable->setVelocity(v);
    QCOMPARE(m_logic->monitorState(), 1);
    QCOMPARE(animate.count(), 0);
}

void tst_PulleyMenuLogic::finalPositionEndsMonitoring()
{
    QSignalSpy reached(m_logic, &PulleyMenuLogic::finalPositionReached);
    m_logic->monitorFlick();
    m_flickable->setVelocity(1000);
    QCOMPARE(m_logic->monitorState(), 2);
    m_flickable->setContentY(m_menu->finalPosition);
    QCOMPARE(reached.count(), 1);
    QCOMPARE(m_logic->monitorState(), 0);
}

void tst_PulleyMenuLogic::survivesMenuDestroyedBySnapHandler()
{
    m_menu->snapVelocity = 150;
    m_flickable->flickDeceleration = 100;
    m_flickable->contentY = 44;
    connect(m_logic, &PulleyMenuLogic::animateFlick, this, [this] {
        delete m_menu; // takes the logic with it
        m_menu = nullptr;
    });
    QPointer<PulleyMenuLogic> logic(m_logic);
    m_logic->monitorFlick();
    m_flickable->setVelocity(-300);
    m_flickable->setVelocity(-100);
    QVERIFY(logic.isNull());
}

void tst_PulleyMenuLogic::clampsFittingContent_data()
{
    QTest::addColumn<bool>("pullDown");
    QTest::addColumn<bool>("otherMenu");
    QTest::addColumn<qreal>("contentY");
    QTest::addColumn<qreal>("expected");
    QTest::newRow("pull-down stops the bottom at max drag") << true << false << 1300.0 << 1200.0;
    QTest::newRow("pull-down, a push-up menu handles the bottom") << true << true << 1300.0 << 1300.0;
    QTest::newRow("push-up stops the top at origin") << false << false << -50.0 << 0.0;
    QTest::newRow("push-up, a pull-down menu handles the top") << false << true << -50.0 << -50.0;
}

void tst_PulleyMenuLogic::clampsFittingContent()
{
    QFETCH(bool, pullDown);
    QFETCH(bool, otherMenu);
    QFETCH(qreal, contentY);
    QFETCH(qreal, expected);
    FakeMenu other;
    m_logic->setPullDownType(pullDown);
    m_menu->inactivePosition = pullDown ? -1000 : 5000; // never out of bounds here
    m_flickable->contentHeight = 500; // fits the 800 px view
    m_flickable->moving = true;
    (pullDown ? m_flickable->pushUpMenu : m_flickable->pullDownMenu) = otherMenu ? &other : nullptr;
    m_flickable->setContentY(contentY);
    QCOMPARE(m_flickable->contentY, expected);
}

void tst_PulleyMenuLogic::contentFollowsTheFinger_data()
{
    // The flickable moves content past its edge at half the finger's pace; the menu is 200 high.
    QTest::addColumn<bool>("pullDown");
    QTest::addColumn<qreal>("flickablePosition");
    QTest::addColumn<qreal>("expected");
    QTest::newRow("pull-down, within the menu: doubled") << true << -40.0 << -80.0;
    QTest::newRow("pull-down, at the menu's end") << true << -100.0 << -200.0;
    QTest::newRow("pull-down, past the menu: half pace") << true << -150.0 << -250.0;
    QTest::newRow("push-up, within the menu: doubled") << false << 30.0 << 60.0;
    QTest::newRow("push-up, past the menu: half pace") << false << 120.0 << 220.0;
}

void tst_PulleyMenuLogic::contentFollowsTheFinger()
{
    QFETCH(bool, pullDown);
    QFETCH(qreal, flickablePosition);
    QFETCH(qreal, expected);
    m_logic->setPullDownType(pullDown);
    m_menu->pullDown = pullDown;
    m_flickable->setDragging(true);
    m_flickable->setContentY(flickablePosition);
    QVERIFY(m_menu->active);
    QCOMPARE(m_flickable->contentY, expected);
    QCOMPARE(m_logic->dragDistance(), float(qAbs(expected)));

    // Let go: the content is left to the flickable.
    m_flickable->setDragging(false);
    m_flickable->setContentY(flickablePosition);
    QCOMPARE(m_flickable->contentY, flickablePosition);
}

void tst_PulleyMenuLogic::knowsHowTheDragEnded_data()
{
    QTest::addColumn<QList<int>>("events");
    QTest::addColumn<bool>("canceled");
    QTest::newRow("lifted") << QList<int> { QEvent::MouseButtonRelease, QEvent::UngrabMouse } << false;
    QTest::newRow("touch cancelled") << QList<int> { QEvent::TouchCancel } << true;
    QTest::newRow("grab taken") << QList<int> { QEvent::UngrabMouse, QEvent::MouseButtonRelease } << true;
}

void tst_PulleyMenuLogic::knowsHowTheDragEnded()
{
    QFETCH(QList<int>, events);
    QFETCH(bool, canceled);
    for (int round = 0; round < 2; ++round) {
        m_flickable->setDragging(true);
        m_flickable->setContentY(-40);
        QVERIFY(m_menu->active);
        QVERIFY(!m_logic->canceled());
        for (int type : events) {
            QEvent event { QEvent::Type(type) };
            m_logic->windowEvent(&event);
        }
        m_flickable->setDragging(false);
        QCOMPARE(m_logic->canceled(), canceled);
        m_flickable->setContentY(0); // back at rest: the next drag starts afresh
        QVERIFY(!m_menu->active);
    }
}

QTEST_MAIN(tst_PulleyMenuLogic)
#include "tst_pulleymenulogic.moc"
