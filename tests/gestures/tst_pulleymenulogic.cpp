#include "gestures/pulleymenulogic.h"

#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QtTest>

#include <cmath>

// The menu (200 high: how far it reaches) and the flickable as the logic sees them:
// properties by name, with their change signals.
static const char Fakes[] = R"(
import QtQuick 2.6
QtObject {
    property Item menu: Item {
        height: 200
        property bool active
        property real _inactivePosition
        property real _snapThreshold: 100
        property real _snapCalculationVelocity: 300
        property bool _pullDown: true
        property real _finalPosition: -500
        property bool _activationInhibited
        property bool _changingListView
        property Item _contentColumn
        property real _maxDragPosition: 1200
    }
    property QtObject flickable: QtObject {
        property real contentY
        property real verticalVelocity
        property bool dragging
        property real flickDeceleration: 1500
        property bool moving
        property bool flickingVertically
        property real contentHeight: 2000
        property real originY
        property real height: 800
        property Item pullDownMenu
        property Item pushUpMenu
        signal flickEnded
    }
})";

class tst_PulleyMenuLogic : public QObject
{
    Q_OBJECT

    QQmlEngine m_engine;
    QScopedPointer<QObject> m_fakes;
    QQuickItem *m_menu = nullptr;
    QObject *m_flickable = nullptr;
    PulleyMenuLogic *m_logic = nullptr;

    void set(QObject *object, const char *name, const QVariant &value) { QVERIFY(object->setProperty(name, value)); }
    void set(const char *name, const QVariant &value) { set(m_flickable, name, value); }
    bool active() const { return m_menu->property("active").toBool(); }
    qreal position() const { return m_flickable->property("contentY").toReal(); }

private Q_SLOTS:
    void init()
    {
        QQmlComponent component(&m_engine);
        component.setData(Fakes, QUrl());
        m_fakes.reset(component.create());
        QVERIFY2(m_fakes, qPrintable(component.errorString()));
        m_menu = m_fakes->property("menu").value<QQuickItem *>();
        m_flickable = m_fakes->property("flickable").value<QObject *>();
        m_logic = new PulleyMenuLogic(m_menu);
        m_logic->componentComplete();
        m_logic->setFlickable(m_flickable);
    }

    void cleanup() { m_fakes.reset(); }

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
        set(m_menu, "_contentColumn", QVariant::fromValue(&column));
        m_menu->setVisible(usable);
        m_logic->setPullDownType(pullDown);
        set("contentY", contentY);
        QCOMPARE(m_logic->outOfBounds(), expected);
        set(m_menu, "_contentColumn", QVariant::fromValue<QQuickItem *>(nullptr));
    }

    // Out of bounds activates only with a finger on the content, never while inhibited;
    // back in bounds deactivates.
    void activatesOnlyWhileDragging()
    {
        set("contentY", -40);
        QVERIFY(!active());
        set("dragging", true);
        QVERIFY(active());
        set("contentY", 0);
        QVERIFY(!active());
        set(m_menu, "_activationInhibited", true);
        set("contentY", -30);
        QVERIFY(!active());
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
        set(m_menu, "_pullDown", pullDown);
        set(m_menu, "_snapCalculationVelocity", 150);
        set("flickDeceleration", 100);
        set("contentY", contentY);
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
        set("contentY", -500); // the menu's final position
        QCOMPARE(reached.count(), 1);
        QCOMPARE(m_logic->monitorState(), 0);
    }

    void survivesMenuDestroyedBySnapHandler()
    {
        set(m_menu, "_snapCalculationVelocity", 150);
        set("flickDeceleration", 100);
        set("contentY", 44);
        connect(m_logic, &PulleyMenuLogic::animateFlick, this, [this] { delete m_menu; }); // and the logic with it
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
        QQuickItem other;
        m_logic->setPullDownType(pullDown);
        set(m_menu, "_inactivePosition", pullDown ? -1000 : 5000); // never out of bounds here
        set("contentHeight", 500); // fits the 800 px view
        set("moving", true);
        set(pullDown ? "pushUpMenu" : "pullDownMenu", QVariant::fromValue<QQuickItem *>(otherMenu ? &other : nullptr));
        set("contentY", contentY);
        QCOMPARE(position(), expected);
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
        set(m_menu, "_pullDown", pullDown);
        set("dragging", true);
        set("contentY", flickablePosition);
        QVERIFY(active());
        QCOMPARE(position(), expected);
        QCOMPARE(m_logic->dragDistance(), float(qAbs(expected)));
        set("dragging", false);
        set("contentY", flickablePosition);
        QCOMPARE(position(), flickablePosition);
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
            QVERIFY(active() && !m_logic->canceled());
            for (int type : events) {
                QEvent event { QEvent::Type(type) };
                m_logic->windowEvent(&event);
            }
            set("dragging", false);
            QCOMPARE(m_logic->canceled(), canceled);
            set("contentY", 0);
            QVERIFY(!active());
        }
    }
};

QTEST_MAIN(tst_PulleyMenuLogic)
#include "tst_pulleymenulogic.moc"
