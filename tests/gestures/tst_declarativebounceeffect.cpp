#include "../common/sceneview.h"
#include "gestures/declarativebounceeffect.h"

#include <QGuiApplication>
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
        "    property alias effect: effect\n"
        "    Flickable {\n"
        "        id: flickable\n"
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
    void drag_data()
    {
        // Steps at x 100: "P y", "M y", "R" press, move and release the mouse; "p<id> y",
        // "m<id> y", "r<id>" the same for a finger (the others stay), "c" cancels the touch;
        // "T" in y stands for the drag distance. "= a [d]" expects active a (and difference
        // d), "# a d" that many activeChanged and differenceChanged signals so far;
        // "interactive 0/1" sets the flickable's.
        QTest::addColumn<int>("contentHeight");
        QTest::addColumn<bool>("withMenu");
        QTest::addColumn<QStringList>("steps");
        QTest::newRow("activates at the drag distance, counts from there, keeps it after release")
                << 1000 << false << QStringList{ "P 100", "M 99+T", "= 0 0", "M 100+T", "= 1 0", "# 1 0",
                                                 "M 125+T", "= 1 25", "R", "= 0 25", "# 2 2" };
        QTest::newRow("fitting content, no menu") << 200 << false << QStringList{ "P 50", "M 60", "M 120", "M 200", "= 0", "R" };
        QTest::newRow("fitting content, a pull-down menu") << 200 << true << QStringList{ "P 50", "M 60", "M 120", "M 200", "= 1", "R" };
        QTest::newRow("pressed outside") << 1000 << false << QStringList{ "P 400", "M 420", "M 480", "M 560", "= 0", "R" };
        QTest::newRow("not while the flickable is not interactive")
                << 1000 << false << QStringList{ "interactive 0", "P 100", "M 110+T", "= 0", "R",
                                                 "interactive 1", "P 100", "M 110+T", "= 1", "R" };
        QTest::newRow("one finger") << 1000 << false << QStringList{ "p0 100", "m0 100+T", "m0 108+T", "= 1 8" };
        QTest::newRow("lifted") << 1000 << false << QStringList{ "p0 100", "m0 100+T", "m0 108+T", "r0", "= 0 8" };
        QTest::newRow("a second finger is not followed")
                << 1000 << false << QStringList{ "p0 100", "p1 280", "m1 290+T", "m1 299+T", "= 0 0" };
        QTest::newRow("the first finger lifts, the second moves")
                << 1000 << false << QStringList{ "p0 100", "p1 280", "r0", "m1 282", "m1 290+T", "= 0 0" };
        QTest::newRow("cancelled") << 1000 << false << QStringList{ "p0 100", "m0 100+T", "m0 150+T", "c", "= 0 50" };
        QTest::newRow("a touch after a cancel anchors afresh")
                << 1000 << false << QStringList{ "p0 100", "m0 100+T", "m0 150+T", "c", "p0 200", "m0 202", "= 0 50" };
    }

    void drag()
    {
        QFETCH(int, contentHeight);
        QFETCH(bool, withMenu);
        QFETCH(QStringList, steps);
        m_view.reset(new QQuickView);
        QQuickItem *root = showScene(*m_view, QString::fromUtf8(Document).arg(contentHeight).arg(withMenu ? "menu" : "null").toUtf8());
        QVERIFY(root);
        auto effect = root->property("effect").value<DeclarativeBounceEffect *>();
        QSignalSpy active(effect, &DeclarativeBounceEffect::activeChanged);
        QSignalSpy difference(effect, &DeclarativeBounceEffect::differenceChanged);

        QTouchDevice *device = QTest::createTouchDevice();
        QMap<int, int> down; // finger id -> y
        int mouseY = 0;
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
            const QString y = QString(words.value(1)).replace(QLatin1Char('T'), QString::number(t()));
            const int at = y.section(QLatin1Char('+'), 0, 0).toInt() + y.section(QLatin1Char('+'), 1).toInt();
            const int id = step.midRef(1, 1).toInt();
            if (step.startsWith(QLatin1Char('P')))
                QTest::mousePress(m_view.data(), Qt::LeftButton, {}, QPoint(100, mouseY = at));
            else if (step.startsWith(QLatin1Char('M')))
                QTest::mouseMove(m_view.data(), QPoint(100, mouseY = at));
            else if (step.startsWith(QLatin1Char('R')))
                QTest::mouseRelease(m_view.data(), Qt::LeftButton, {}, QPoint(100, mouseY));
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
