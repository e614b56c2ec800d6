#include "gestures/pulleymenulogic.h"

#include <QQuickItem>
#include <QtTest>

#include <cmath>

// The flickable as the logic sees it: properties by name; writes announce a change.
class FakeFlickable : public QObject
{
    Q_OBJECT
    Q_PROPERTY(qreal contentY MEMBER contentY NOTIFY contentYChanged)
    Q_PROPERTY(qreal verticalVelocity MEMBER verticalVelocity NOTIFY verticalVelocityChanged)
    Q_PROPERTY(bool dragging MEMBER dragging NOTIFY draggingChanged)
    Q_PROPERTY(qreal flickDeceleration MEMBER flickDeceleration)
    Q_PROPERTY(bool moving MEMBER moving)
    Q_PROPERTY(bool flickingVertically MEMBER flickingVertically)
    Q_PROPERTY(qreal contentHeight MEMBER contentHeight)
    Q_PROPERTY(qreal originY MEMBER originY)
    Q_PROPERTY(qreal height MEMBER height)
    Q_PROPERTY(QObject *pullDownMenu MEMBER pullDownMenu)
    Q_PROPERTY(QObject *pushUpMenu MEMBER pushUpMenu)

public:
    qreal contentY = 0, verticalVelocity = 0, flickDeceleration = 1500, contentHeight = 2000, originY = 0, height = 800;
    bool dragging = false, moving = false, flickingVertically = false;
    QObject *pullDownMenu = nullptr, *pushUpMenu = nullptr;

Q_SIGNALS:
    void contentYChanged();
    void verticalVelocityChanged();
    void draggingChanged();
    void flickEnded();
};

// The menu as the logic sees it: an item 200 high (how far it reaches) with the properties
// the logic reads by name.
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
    bool active = false, pullDown = true, activationInhibited = false, changingListView = false;
    qreal inactivePosition = 0, snapThreshold = 100, snapVelocity = 300, finalPosition = -500, maxDragPosition = 1200;
    QObject *contentColumn = nullptr;
};

class tst_PulleyMenuLogic : public QObject
{
    Q_OBJECT

    FakeMenu *m_menu = nullptr;
    FakeFlickable *m_flickable = nullptr;
    PulleyMenuLogic *m_logic = nullptr;

    void set(const char *name, const QVariant &value) { QVERIFY(m_flickable->setProperty(name, value)); }

private Q_SLOTS:
    void init()
    {
        m_menu = new FakeMenu;
        m_flickable = new FakeFlickable;
        m_logic = new PulleyMenuLogic(m_menu);
        m_logic->componentComplete();
        m_logic->setFlickable(m_flickable);
    }

    void cleanup()
    {
        delete m_menu;
        delete m_flickable;
    }

    void outOfBounds_data()
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

    void outOfBounds()
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

    // Out of bounds activates only with a finger on the content, never while inhibited;
    // back in bounds deactivates.
    void activatesOnlyWhileDragging()
    {
        set("contentY", -40);
        QVERIFY(!m_menu->active);
        set("dragging", true);
        QVERIFY(m_menu->active);
        set("contentY", 0);
        QVERIFY(!m_menu->active);
        m_menu->activationInhibited = true;
        set("contentY", -30);
        QVERIFY(!m_menu->active);
    }

    // A flick is watched from monitorFlick(): once faster than the snap velocity, then
    // slowing below it, its predicted end decides whether the content snaps to its rest.
    void monitor_data()
    {
        QTest::addColumn<bool>("pullDown");
        QTest::addColumn<qreal>("contentY");
        QTest::addColumn<QList<qreal>>("velocities");
        QTest::addColumn<QList<int>>("states"); // after each velocity
        QTest::addColumn<bool>("snaps");
        // Deceleration 100 and |v| 100 flick for one second over 50 px; the prediction is then
        // contentY - 50 + 7 (moving up) or contentY + 50 - 7 (moving down).
        const QList<qreal> up { -300, -200, -100 }, down { 300, 200, 100 };
        const QList<int> states { 2, 2, 0 };
        QTest::newRow("pull-down, predicted exactly at rest") << true << 43.0 << up << states << false;
        QTest::newRow("pull-down, just past rest") << true << 44.0 << up << states << true;
        QTest::newRow("pull-down, beyond the threshold") << true << 200.0 << up << states << false;
        QTest::newRow("pull-down, predicted short of rest") << true << 20.0 << up << states << false;
        QTest::newRow("push-up, just short of rest") << false << -44.0 << down << states << true;
        QTest::newRow("push-up, predicted exactly at rest") << false << -43.0 << down << states << false;
        QTest::newRow("never faster than the snap velocity") << true << 44.0 << QList<qreal> { 100, 150, 50, 0 }
                                                             << QList<int> { 1, 1, 1, 1 } << false;
    }

    void monitor()
    {
        QFETCH(bool, pullDown);
        QFETCH(qreal, contentY);
        QFETCH(QList<qreal>, velocities);
        QFETCH(QList<int>, states);
        QFETCH(bool, snaps);
        m_menu->pullDown = pullDown;
        m_menu->snapVelocity = 150;
        m_flickable->flickDeceleration = 100;
        m_flickable->contentY = contentY;
        QSignalSpy animate(m_logic, &PulleyMenuLogic::animateFlick);
        m_logic->monitorFlick();
        QCOMPARE(m_logic->monitorState(), 1);
        for (int i = 0; i < velocities.size(); ++i) {
            set("verticalVelocity", velocities.at(i));
            QCOMPARE(m_logic->monitorState(), states.at(i));
        }
        QCOMPARE(animate.count(), snaps ? 1 : 0);
        if (snaps) {
            QCOMPARE(animate.first().at(0).toFloat(), std::pow(float(std::fabs(2.0 * contentY / 100.0)), 0.5f));
            QCOMPARE(animate.first().at(1).toFloat(), 0.0f);
        }
    }

    void finalPositionEndsMonitoring()
    {
        QSignalSpy reached(m_logic, &PulleyMenuLogic::finalPositionReached);
        m_logic->monitorFlick();
        set("verticalVelocity", 1000);
        QCOMPARE(m_logic->monitorState(), 2);
        set("contentY", m_menu->finalPosition);
        QCOMPARE(reached.count(), 1);
        QCOMPARE(m_logic->monitorState(), 0);
    }

    void survivesMenuDestroyedBySnapHandler()
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
        set("verticalVelocity", -300);
        set("verticalVelocity", -100);
        QVERIFY(logic.isNull());
    }

    void clampsFittingContent_data()
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

    void clampsFittingContent()
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
        set("contentY", contentY);
        QCOMPARE(m_flickable->contentY, expected);
    }

    // The flickable moves content past its edge at half the finger's pace: doubled up to the
    // menu's 200 px, half the menu more beyond; once the finger lifts, left as it is.
    void contentFollowsTheFinger_data()
    {
        QTest::addColumn<bool>("pullDown");
        QTest::addColumn<qreal>("flickablePosition");
        QTest::addColumn<qreal>("expected");
        QTest::newRow("pull-down, within the menu: doubled") << true << -40.0 << -80.0;
        QTest::newRow("pull-down, at the menu's end") << true << -100.0 << -200.0;
        QTest::newRow("pull-down, past the menu: half pace") << true << -150.0 << -250.0;
        QTest::newRow("push-up, within the menu: doubled") << false << 30.0 << 60.0;
        QTest::newRow("push-up, past the menu: half pace") << false << 120.0 << 220.0;
    }

    void contentFollowsTheFinger()
    {
        QFETCH(bool, pullDown);
        QFETCH(qreal, flickablePosition);
        QFETCH(qreal, expected);
        m_logic->setPullDownType(pullDown);
        m_menu->pullDown = pullDown;
        set("dragging", true);
        set("contentY", flickablePosition);
        QVERIFY(m_menu->active);
        QCOMPARE(m_flickable->contentY, expected);
        QCOMPARE(m_logic->dragDistance(), float(qAbs(expected)));
        set("dragging", false);
        set("contentY", flickablePosition);
        QCOMPARE(m_flickable->contentY, flickablePosition);
    }

    void knowsHowTheDragEnded_data()
    {
        QTest::addColumn<QList<int>>("events");
        QTest::addColumn<bool>("canceled");
        QTest::newRow("lifted") << QList<int> { QEvent::MouseButtonRelease, QEvent::UngrabMouse } << false;
        QTest::newRow("touch cancelled") << QList<int> { QEvent::TouchCancel } << true;
        QTest::newRow("grab taken") << QList<int> { QEvent::UngrabMouse, QEvent::MouseButtonRelease } << true;
    }

    void knowsHowTheDragEnded()
    {
        QFETCH(QList<int>, events);
        QFETCH(bool, canceled);
        for (int round = 0; round < 2; ++round) { // the next drag starts afresh
            set("dragging", true);
            set("contentY", -40);
            QVERIFY(m_menu->active && !m_logic->canceled());
            for (int type : events) {
                QEvent event { QEvent::Type(type) };
                m_logic->windowEvent(&event);
            }
            set("dragging", false);
            QCOMPARE(m_logic->canceled(), canceled);
            set("contentY", 0);
            QVERIFY(!m_menu->active);
        }
    }
};

QTEST_MAIN(tst_PulleyMenuLogic)
#include "tst_pulleymenulogic.moc"
