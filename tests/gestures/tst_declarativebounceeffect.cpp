#include "declarativebounceeffect.h"

#include <QGuiApplication>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickView>
#include <QStyleHints>
#include <QtTest>

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
    void touchDragActivates();
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

void tst_DeclarativeBounceEffect::touchDragActivates()
{
    DeclarativeBounceEffect *effect = load(1000, false);
    QVERIFY(effect);
    QTouchDevice *device = QTest::createTouchDevice();
    QTest::touchEvent(m_view.data(), device).press(0, QPoint(100, 100));
    QTest::touchEvent(m_view.data(), device).move(0, QPoint(100, 100 + t()));
    QTest::touchEvent(m_view.data(), device).move(0, QPoint(100, 100 + t() + 8));
    QVERIFY(effect->active());
    QCOMPARE(effect->difference(), 8.0f);
    QTest::touchEvent(m_view.data(), device).release(0, QPoint(100, 100 + t() + 8));
    QVERIFY(!effect->active());
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
