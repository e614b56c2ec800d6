#include "../common/sceneview.h"
#include "gestures/declarativebounceeffect.h"

#include <QGuiApplication>
#include <QStyleHints>
#include <QtTest>
#include <qpa/qwindowsysteminterface.h>

// An application window with a flickable in its top half; the effect watches it. The
// flickable stops at its bounds so that only the effect reacts to over-edge drags; %1 is
// what a test sets on it or puts into it (a content height of 1000 unless it says).
static const QByteArray Document =
        "import QtQuick 2.6\n"
        "import Quorvane.Pelkan 1.0\n"
        "import Quorvane.Pelkan.private 1.0 as Private\n"
        "Private.Window {\n"
        "    width: 400; height: 600\n"
        "    property alias effect: effect\n"
        "    Flickable {\n"
        "        id: flickable\n"
        "        width: 400; height: 300\n"
        "        boundsBehavior: Flickable.StopAtBounds\n"
        "        property Item pullDownMenu: null\n"
        "        property Item pushUpMenu: null\n"
        "        %1\n"
        "    }\n"
        "    Item { id: menu }\n"
        "    BounceEffect { id: effect; flickable: flickable }\n"
        "}\n";

class tst_DeclarativeBounceEffect : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void drag_data()
    {
        // Steps: "P p", "M p", "R" press, move and release the mouse at p; "p<id> p", "m<id> p",
        // "r<id>" the same for a finger (the others stay), "c" cancels the touch. p is "x,y"
        // or "y" at x 100; "T" in it stands for the drag distance. "= a [d]" expects active a
        // (and difference d), "# a d" that many activeChanged and differenceChanged signals so
        // far; "interactive 0/1" sets the flickable's; "steal" has another item grab the mouse.
        QTest::addColumn<QString>("setup");
        QTest::addColumn<QStringList>("steps");
        QTest::newRow("activates at the drag distance, counts from there, keeps it after release")
                << "" << QStringList{ "P 100", "M 99+T", "= 0 0", "M 100+T", "= 1 0", "# 1 0", "M 125+T", "= 1 25", "R", "= 0 25", "# 2 2" };
        QTest::newRow("fitting content, no menu") << "contentHeight: 200" << QStringList{ "P 50", "M 60", "M 120", "M 200", "= 0", "R" };
        QTest::newRow("fitting content, a pull-down menu")
                << "contentHeight: 200; pullDownMenu: menu" << QStringList{ "P 50", "M 60", "M 120", "M 200", "= 1", "R" };
        QTest::newRow("content as tall as the view is no direction, menu or not")
                << "contentHeight: 300; pullDownMenu: menu" << QStringList{ "P 50", "M 60", "M 120", "M 200", "= 0", "R" };
        QTest::newRow("vertical flick, content as tall as the view, no menu")
                << "contentHeight: 300; flickableDirection: Flickable.VerticalFlick" << QStringList{ "P 50", "M 60", "M 120", "M 200", "= 0", "R" };
        QTest::newRow("pushed up at the end, anchored where it activated")
                << "contentY: 700" << QStringList{ "P 250", "M 251-T", "= 0 0", "M 240-T", "= 1 10", "M 230-T", "= 1 0", "R" };
        QTest::newRow("pulled right at the beginning")
                << "contentWidth: 1000; contentHeight: 300"
                << QStringList{ "P 100,100", "M 99+T,100", "= 0 0", "M 110+T,100", "= 1 10", "M 100+T,100", "= 1 0", "R" };
        QTest::newRow("pulled left at the end")
                << "contentWidth: 1000; contentHeight: 300; contentX: 600"
                << QStringList{ "P 300,100", "M 301-T,100", "= 0 0", "M 290-T,100", "= 1 10", "M 270-T,100", "= 1 10", "R" };
        QTest::newRow("pushed up at the top") << "" << QStringList{ "P 200", "M 200-T", "= 0", "R" };
        QTest::newRow("pressed outside") << "" << QStringList{ "P 400", "M 420", "M 480", "M 560", "= 0", "R" };
        QTest::newRow("an item inside keeps the grab") << "MouseArea { width: 400; height: 1000; preventStealing: true }"
                                                      << QStringList{ "P 100", "M 110+T", "= 0", "R" };
        QTest::newRow("the grab taken away ends it") << "" << QStringList{ "P 100", "M 100+T", "= 1 0", "steal", "M 130+T", "= 0", "R" };
        QTest::newRow("not while the flickable is not interactive")
                << "" << QStringList{ "interactive 0", "P 100", "M 110+T", "= 0", "R", "interactive 1", "P 100", "M 110+T", "= 1", "R" };
        QTest::newRow("one finger") << "" << QStringList{ "p0 100", "m0 100+T", "m0 108+T", "= 1 8" };
        QTest::newRow("lifted") << "" << QStringList{ "p0 100", "m0 100+T", "m0 108+T", "r0", "= 0 8" };
        QTest::newRow("a second finger is not followed") << "" << QStringList{ "p0 100", "p1 280", "m1 290+T", "m1 299+T", "= 0 0" };
        QTest::newRow("the first finger lifts, the second moves")
                << "" << QStringList{ "p0 100", "p1 280", "r0", "m1 282", "m1 290+T", "= 0 0" };
        QTest::newRow("cancelled") << "" << QStringList{ "p0 100", "m0 100+T", "m0 150+T", "c", "= 0 50" };
        QTest::newRow("a touch after a cancel anchors afresh")
                << "" << QStringList{ "p0 100", "m0 100+T", "m0 150+T", "c", "p0 200", "m0 202", "= 0 50" };
    }

    void drag()
    {
        QFETCH(QString, setup);
        QFETCH(QStringList, steps);
        if (!setup.contains(QLatin1String("contentHeight")))
            setup.prepend(QLatin1String("contentHeight: 1000; "));
        m_view.reset(new QQuickView);
        QQuickItem *root = showScene(*m_view, QString::fromUtf8(Document).arg(setup).toUtf8());
        QVERIFY(root);
        auto effect = root->property("effect").value<DeclarativeBounceEffect *>();
        QSignalSpy active(effect, &DeclarativeBounceEffect::activeChanged);
        QSignalSpy difference(effect, &DeclarativeBounceEffect::differenceChanged);

        QTouchDevice *device = QTest::createTouchDevice();
        QMap<int, int> down; // finger id -> y
        QPoint mouse;
        for (const QString &step : qAsConst(steps)) {
            const QStringList words = step.split(QLatin1Char(' '));
            if (words.first() == QLatin1String("=")) {
                QCOMPARE(effect->active(), words.at(1) == QLatin1String("1"));
                if (words.size() > 2)
                    QCOMPARE(effect->difference(), words.at(2).toFloat());
                continue;
            }
            if (words.first() == QLatin1String("#")) {
                QCOMPARE(active.count(), words.at(1).toInt());
                QCOMPARE(difference.count(), words.at(2).toInt());
                continue;
            }
            if (words.first() == QLatin1String("interactive")) {
                effect->flickable()->setProperty("interactive", words.at(1) == QLatin1String("1"));
                continue;
            }
            if (words.first() == QLatin1String("steal")) {
                (new QQuickItem(root))->grabMouse();
                continue;
            }
            // "x,y" or "y", each a sum such as 99+T or 240-T.
            QStringList xy = QString(words.value(1)).replace(QLatin1Char('T'), QString::number(t())).split(QLatin1Char(','));
            if (xy.size() == 1)
                xy.prepend(QStringLiteral("100"));
            QPoint position;
            for (int i = 0; i < 2; ++i) {
                for (const QString &term : QString(xy.at(i)).replace(QLatin1Char('-'), QLatin1String("+-")).split(QLatin1Char('+')))
                    (i ? position.ry() : position.rx()) += term.toInt();
            }
            const int at = position.y();
            const int id = step.midRef(1, 1).toInt();
            if (step.startsWith(QLatin1Char('P')))
                QTest::mousePress(m_view.data(), Qt::LeftButton, {}, mouse = position);
            else if (step.startsWith(QLatin1Char('M')))
                QTest::mouseMove(m_view.data(), mouse = position);
            else if (step.startsWith(QLatin1Char('R')))
                QTest::mouseRelease(m_view.data(), Qt::LeftButton, {}, mouse);
            else if (step == QLatin1String("c")) {
                QWindowSystemInterface::handleTouchCancelEvent<QWindowSystemInterface::SynchronousDelivery>(m_view.data(), device);
                down.clear();
            } else {
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
        }
        QTest::QTouchEventSequence end = QTest::touchEvent(m_view.data(), device);
        for (auto it = down.cbegin(); it != down.cend(); ++it)
            end.release(it.key(), QPoint(100, it.value()));
    }

    void cleanup() { m_view.reset(); }

private:
    int t() const { return QGuiApplication::styleHints()->startDragDistance(); }
    QScopedPointer<QQuickView> m_view;
};

QTEST_MAIN(tst_DeclarativeBounceEffect)
#include "tst_declarativebounceeffect.moc"
