#include "gestures/declarativebounceeffect.h"

#include <QGuiApplication>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickView>
#include <QStyleHints>
#include <QtTest>
#include <qpa/qwindowsysteminterface.h>

// An application window with a flickable in its top half; the effect watches it. The
// flickable stops at its bounds so that only the effect reacts to over-edge drags.
static const QByteArray Document =
        "import QtQuick 2.6\n"
        "import Quorvane.Pelkan 1.0\n"
        "import Quorvane.Pelkan.private 1.0 as Private\n"
        "Private.Window {\n"
        "    width: 400; height: 600\n"
        "    property alias flickable: flickable\n"
        "    property alias effect: effect\n"
        "    Flickable {\n"
        "        id: flickable\n"
        "        objectName: 'flickable'\n"
        "        width: 400; height: 300\n"
        "        boundsBehavior: Flickable.StopAtBounds\n"
        "        contentHeight: %1\n"
        "        property Item pullDownMenu: %2\n"
        "        property Item pushUpMenu: null\n"
        "    }\n"
        "    Item { id: menu }\n"
        "    BounceEffect { id: effect; flickable: flickable }\n"
        "}\n";

class tst_DeclarativeBounceEffect : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { m_view.reset(); }
    void activatesAtTheDragDistance();
    void fittingContentNeedsAMenu_data();
    void fittingContentNeedsAMenu();
    void pressOutsideIsIgnored();
    void differenceKeptAfterRelease();
    void touch_data();
    void touch();
    void detachedWhileNotInteractive();

private:
    DeclarativeBounceEffect *load(int contentHeight, bool withMenu);
    int t() const { return QGuiApplication::styleHints()->startDragDistance(); }
    QScopedPointer<QQuickView> m_view;
};

DeclarativeBounceEffect *tst_DeclarativeBounceEffect::load(int contentHeight, bool withMenu)
{
    m_view.reset(new QQuickView);
    const QByteArray text = QString::fromUtf8(Document).arg(contentHeight).arg(withMenu ? "menu" : "null").toUtf8();
    QQmlComponent component(m_view->engine());
    component.setData(text, QUrl());
    auto root = qobject_cast<QQuickItem *>(component.create());
    if (!root) {
        qWarning() << component.errorString();
        return nullptr;
    }
    m_view->setContent(QUrl(), nullptr, root);
    m_view->resize(400, 600);
    m_view->show();
    if (!QTest::qWaitForWindowExposed(m_view.data()))
        return nullptr;
    return root->property("effect").value<DeclarativeBounceEffect *>();
}

void tst_DeclarativeBounceEffect::activatesAtTheDragDistance()
{
    DeclarativeBounceEffect *effect = load(1000, false);
    QVERIFY(effect);
    QSignalSpy active(effect, &DeclarativeBounceEffect::activeChanged);
    QTest::mousePress(m_view.data(), Qt::LeftButton, {}, QPoint(100, 100));
    QTest::mouseMove(m_view.data(), QPoint(100, 100 + t() - 1));
    QVERIFY(!effect->active());
    QTest::mouseMove(m_view.data(), QPoint(100, 100 + t()));
    QVERIFY(effect->active());
    QCOMPARE(effect->difference(), 0.0f);
    QCOMPARE(active.count(), 1);
    // The distance goes on from the activation point.
    QTest::mouseMove(m_view.data(), QPoint(100, 100 + t() + 25));
    QCOMPARE(effect->difference(), 25.0f);
    QTest::mouseRelease(m_view.data(), Qt::LeftButton, {}, QPoint(100, 100 + t() + 25));
    QVERIFY(!effect->active());
}

void tst_DeclarativeBounceEffect::fittingContentNeedsAMenu_data()
{
    QTest::addColumn<bool>("withMenu");
    QTest::newRow("no pull-down menu") << false;
    QTest::newRow("with a pull-down menu") << true;
}

void tst_DeclarativeBounceEffect::fittingContentNeedsAMenu()
{
    QFETCH(bool, withMenu);
    DeclarativeBounceEffect *effect = load(200, withMenu);
    QVERIFY(effect);
    QTest::mousePress(m_view.data(), Qt::LeftButton, {}, QPoint(100, 50));
    for (int y = 60; y <= 200; y += 20)
        QTest::mouseMove(m_view.data(), QPoint(100, y));
    QCOMPARE(effect->active(), withMenu);
    QTest::mouseRelease(m_view.data(), Qt::LeftButton, {}, QPoint(100, 200));
}

void tst_DeclarativeBounceEffect::pressOutsideIsIgnored()
{
    DeclarativeBounceEffect *effect = load(1000, false);
    QVERIFY(effect);
    QTest::mousePress(m_view.data(), Qt::LeftButton, {}, QPoint(100, 400));
    for (int y = 420; y <= 560; y += 20)
        QTest::mouseMove(m_view.data(), QPoint(100, y));
    QVERIFY(!effect->active());
    QTest::mouseRelease(m_view.data(), Qt::LeftButton, {}, QPoint(100, 560));
}

void tst_DeclarativeBounceEffect::differenceKeptAfterRelease()
{
    DeclarativeBounceEffect *effect = load(1000, false);
    QVERIFY(effect);
    QTest::mousePress(m_view.data(), Qt::LeftButton, {}, QPoint(100, 100));
    QTest::mouseMove(m_view.data(), QPoint(100, 100 + t()));
    QTest::mouseMove(m_view.data(), QPoint(100, 100 + t() + 12));
    QSignalSpy difference(effect, &DeclarativeBounceEffect::differenceChanged);
    QTest::mouseRelease(m_view.data(), Qt::LeftButton, {}, QPoint(100, 100 + t() + 12));
    QVERIFY(!effect->active());
    QCOMPARE(difference.count(), 1);
    QCOMPARE(effect->difference(), 12.0f);
}

void tst_DeclarativeBounceEffect::touch_data()
{
    // Steps: "p<id> y" press, "m<id> y" move, "r<id>" release of a finger at x 100 (the
    // other fingers stay where they are), "c" cancel; "T" stands for the drag distance.
    QTest::addColumn<QStringList>("steps");
    QTest::addColumn<bool>("active");
    QTest::addColumn<float>("difference");
    QTest::newRow("one finger") << QStringList{ "p0 100", "m0 100+T", "m0 108+T" } << true << 8.0f;
    QTest::newRow("lifted") << QStringList{ "p0 100", "m0 100+T", "m0 108+T", "r0" } << false << 8.0f;
    QTest::newRow("a second finger is not followed")
            << QStringList{ "p0 100", "p1 280", "m1 290+T", "m1 299+T" } << false << 0.0f;
    QTest::newRow("the first finger lifts, the second moves")
            << QStringList{ "p0 100", "p1 280", "r0", "m1 282", "m1 290+T" } << false << 0.0f;
    QTest::newRow("cancelled") << QStringList{ "p0 100", "m0 100+T", "m0 150+T", "c" } << false << 50.0f;
    QTest::newRow("a touch after a cancel anchors afresh")
            << QStringList{ "p0 100", "m0 100+T", "m0 150+T", "c", "p0 200", "m0 202" } << false << 50.0f;
}

void tst_DeclarativeBounceEffect::touch()
{
    QFETCH(QStringList, steps);
    QFETCH(bool, active);
    QFETCH(float, difference);
    DeclarativeBounceEffect *effect = load(1000, false);
    QVERIFY(effect);
    QTouchDevice *device = QTest::createTouchDevice();
    QMap<int, int> down; // finger id -> y
    for (const QString &step : qAsConst(steps)) {
        const int id = step.midRef(1, 1).toInt();
        QString y = step.section(QLatin1Char(' '), 1);
        y.replace(QLatin1Char('T'), QString::number(t()));
        const int at = y.section(QLatin1Char('+'), 0, 0).toInt() + y.section(QLatin1Char('+'), 1).toInt();
        if (step == QLatin1String("c")) {
            QWindowSystemInterface::handleTouchCancelEvent<QWindowSystemInterface::SynchronousDelivery>(m_view.data(), device);
            down.clear();
            continue;
        }
        QTest::QTouchEventSequence sequence = QTest::touchEvent(m_view.data(), device);
        for (auto it = down.cbegin(); it != down.cend(); ++it) {
            if (it.key() != id)
                sequence.stationary(it.key());
        }
        if (step.startsWith(QLatin1Char('p')))
            sequence.press(id, QPoint(100, at));
        else if (step.startsWith(QLatin1Char('m')))
            sequence.move(id, QPoint(100, at));
        else
            sequence.release(id, QPoint(100, down.value(id)));
        sequence.commit();
        if (step.startsWith(QLatin1Char('r')))
            down.remove(id);
        else
            down.insert(id, at);
    }
    QCOMPARE(effect->active(), active);
    QCOMPARE(effect->difference(), difference);
    QTest::QTouchEventSequence end = QTest::touchEvent(m_view.data(), device);
    for (auto it = down.cbegin(); it != down.cend(); ++it)
        end.release(it.key(), QPoint(100, it.value()));
}

void tst_DeclarativeBounceEffect::detachedWhileNotInteractive()
{
    DeclarativeBounceEffect *effect = load(1000, false);
    QVERIFY(effect);
    QObject *flickable = effect->flickable();
    flickable->setProperty("interactive", false);
    QTest::mousePress(m_view.data(), Qt::LeftButton, {}, QPoint(100, 100));
    QTest::mouseMove(m_view.data(), QPoint(100, 100 + t() + 10));
    QVERIFY(!effect->active());
    QTest::mouseRelease(m_view.data(), Qt::LeftButton, {}, QPoint(100, 100 + t() + 10));

    flickable->setProperty("interactive", true);
    QTest::mousePress(m_view.data(), Qt::LeftButton, {}, QPoint(100, 100));
    QTest::mouseMove(m_view.data(), QPoint(100, 100 + t() + 10));
    QVERIFY(effect->active());
    QTest::mouseRelease(m_view.data(), Qt::LeftButton, {}, QPoint(100, 100 + t() + 10));
}

QTEST_MAIN(tst_DeclarativeBounceEffect)
#include "tst_declarativebounceeffect.moc"
