// Lists, in one process, alternating rounds: the work per frame (synchronising to swap)
// while a 1000-row ListView scrolls a step per frame, with Pelkan's ListItem against Qt
// Quick Controls 2's ItemDelegate; and while a pull-down menu is dragged open over the
// Pelkan list against the same list without a menu. Prints medians and ratios.

#include "../common/summary.h"
#include "../common/documentview.h"
#include "../common/framework.h"
#include "../common/median.h"

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickView>
#include <QTest>
#include <QTextStream>

#include <algorithm>
#include <vector>

namespace {

QByteArray document(const QByteArray &kind)
{
    if (kind == "qqc2")
        return "import QtQuick 2.6\nimport QtQuick.Controls 2.15\n"
               "ListView { width: 540; height: 960; model: 1000\n"
               "  delegate: ItemDelegate { width: ListView.view.width; height: 80; text: 'Row ' + index } }\n";
    QByteArray text = "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n"
                      "ListView { width: 540; height: 960; model: 1000\n"
                      "  delegate: ListItem { contentHeight: 80\n"
                      "    Text { x: 24; anchors.verticalCenter: parent.verticalCenter; text: 'Row ' + index; color: 'white' } }\n";
    if (kind == "menu")
        text += "  PullDownMenu { MenuItem { text: 'One' } MenuItem { text: 'Two' } MenuItem { text: 'Three' } }\n";
    return text + "}\n";
}

// Milliseconds of work per frame: scrolling (drag = false) sets contentY a step per frame;
// dragging moves a finger down from the top, pulling the content past its start.
double run(const QByteArray &kind, bool drag)
{
    QQuickView view;
    QQuickItem *root = showDocument(view, document(kind), QStringLiteral(PELKAN_QML_DIR));
    if (!root)
        return 0;

    if (!drag)
        return msPerStep(view, 150, [root](int i) { root->setProperty("contentY", (i + 1) * 53); });

    // The frames of the release (the content settling) count too.
    FrameWork work(view);
    QTest::qWait(100);
    work.reset();
    int y = 20;
    QTest::mousePress(&view, Qt::LeftButton, {}, QPoint(270, y));
    for (int i = 0; i < 60; ++i) {
        y += 12;
        QTest::mouseMove(&view, QPoint(270, y), 16);
        work.waitForFrame();
    }
    QTest::mouseRelease(&view, Qt::LeftButton, {}, QPoint(270, y), 16);
    return work.msPerFrame();
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    QTextStream out(stdout);
    std::vector<double> ours, theirs, menu, plain;
    for (int round = 0; round < 5; ++round) {
        ours.push_back(run("pelkan", false));
        theirs.push_back(run("qqc2", false));
        menu.push_back(run("menu", true));
        plain.push_back(run("pelkan", true));
    }
    out << QStringLiteral("1000-row list scrolled, work per frame (median of 5): ListItem %1 ms, ItemDelegate %2 ms, %3x\n")
               .arg(median(ours), 0, 'f', 2).arg(median(theirs), 0, 'f', 2).arg(median(ours) / median(theirs), 0, 'f', 2);
    out << QStringLiteral("Pull-down menu dragged open over it: %1 ms, the list without a menu %2 ms, %3x\n")
               .arg(median(menu), 0, 'f', 2).arg(median(plain), 0, 'f', 2).arg(median(menu) / median(plain), 0, 'f', 2);
    Summary::row(QStringLiteral("1000-row list scrolled, ListItem vs ItemDelegate"), Summary::ms(median(ours)),
                 Summary::ms(median(theirs)), median(ours) / median(theirs));
    Summary::row(QStringLiteral("pull-down menu dragged open vs the list without one"), Summary::ms(median(menu)),
                 Summary::ms(median(plain)), median(menu) / median(plain), Summary::AtMost, 0);
    return 0;
}
