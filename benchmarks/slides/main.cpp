// Sliding between items of a 1000-item model, in one process, alternating rounds: the work
// per frame (synchronising to swap) while a finger drags across five items, Pelkan's
// SlideshowView against Qt Quick Controls 2's SwipeView (its documented way with many
// pages: a Loader per page, active near the current one), with the same delegate; and how
// many delegates are alive at the most. Prints medians and the ratio.

#include "../common/summary.h"
#include "../common/documentview.h"
#include "../common/framework.h"
#include "../common/median.h"

#include <QGuiApplication>
#include <QQuickItem>
#include <QQuickView>
#include <QTest>
#include <QTextStream>

#include <algorithm>
#include <vector>

namespace {

const QByteArray Delegate = "Rectangle { width: 540; height: 960; color: Qt.hsla((index % 12) / 12, 0.5, 0.4, 1)\n"
                            "  Component.onCompleted: ++root.alive; Component.onDestruction: --root.alive\n"
                            "  Text { anchors.centerIn: parent; text: 'Item ' + index; font.pixelSize: 48; color: 'white' } }\n";

QByteArray document(bool pelkan)
{
    if (pelkan)
        return "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n"
               "Item { id: root; width: 540; height: 960; property int alive: 0; property int most: 0\n"
               "  onAliveChanged: most = Math.max(most, alive)\n"
               "  SlideshowView { anchors.fill: parent; loops: false; cacheSize: 2; model: 1000\n"
               "    delegate: " + Delegate + " } }\n";
    return "import QtQuick 2.6\nimport QtQuick.Controls 2.15\n"
           "Item { id: root; width: 540; height: 960; property int alive: 0; property int most: 0\n"
           "  onAliveChanged: most = Math.max(most, alive)\n"
           "  SwipeView { anchors.fill: parent\n"
           "    Repeater { model: 1000\n"
           "      Loader { active: SwipeView.isCurrentItem || SwipeView.isNextItem || SwipeView.isPreviousItem\n"
           "        sourceComponent: " + Delegate + " } } } }\n";
}

struct Result {
    double frameMs = 0;
    int most = 0;
};

Result run(bool pelkan)
{
    QQuickView view;
    QQuickItem *root = showDocument(view, document(pelkan), QStringLiteral(PELKAN_QML_DIR));
    if (!root)
        return {};
    FrameWork work(view);
    QTest::qWait(100);
    work.reset();
    // Five slides, each a drag of three quarters of the width, a frame per move.
    for (int slide = 0; slide < 5; ++slide) {
        int x = 500;
        QTest::mousePress(&view, Qt::LeftButton, {}, QPoint(x, 480));
        for (int i = 0; i < 30; ++i) {
            x -= 13;
            QTest::mouseMove(&view, QPoint(x, 480), 16);
            work.waitForFrame();
        }
        QTest::mouseRelease(&view, Qt::LeftButton, {}, QPoint(x, 480), 16);
        QTest::qWait(400); // settling, frames counted as they come
    }
    return { work.msPerFrame(), root->property("most").toInt() };
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    QTextStream out(stdout);
    std::vector<double> ours, theirs;
    int ourMost = 0, theirMost = 0;
    for (int round = 0; round < 5; ++round) {
        const Result a = run(true);
        const Result b = run(false);
        ours.push_back(a.frameMs);
        theirs.push_back(b.frameMs);
        ourMost = std::max(ourMost, a.most);
        theirMost = std::max(theirMost, b.most);
    }
    out << QStringLiteral("Sliding through a 1000-item model, work per frame (median of 5): SlideshowView %1 ms "
                          "(at most %2 delegates alive, cache 2), SwipeView %3 ms (at most %4), %5x\n")
               .arg(median(ours), 0, 'f', 2).arg(ourMost).arg(median(theirs), 0, 'f', 2).arg(theirMost)
               .arg(median(ours) / median(theirs), 0, 'f', 2);
    Summary::row(QStringLiteral("sliding a 1000-item model, SlideshowView vs SwipeView"), Summary::ms(median(ours)),
                 Summary::ms(median(theirs)), median(ours) / median(theirs));
    return 0;
}
