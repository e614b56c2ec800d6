// A 1000-row Column scrolled a step per frame, with VisibilityCull and without, in one
// process: rows drawn, and the work per frame (synchronising to swap, render thread) and
// per step (the GUI thread's share). Prints both and the ratios.

#include "../common/documentview.h"
#include "../common/framework.h"

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

QByteArray document(bool cull)
{
    return QByteArray("import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0 as P\n"
                      "Flickable { width: 540; height: 960; contentHeight: column.height\n"
                      "  Column { id: column; width: parent.width\n")
            + (cull ? "    P.VisibilityCull { objectName: 'cull' }\n" : "")
            + "    Repeater { model: 1000\n"
              "      Rectangle { width: column.width; height: 60; color: index % 2 ? '#223' : '#334'\n"
              "        Text { x: 20; anchors.verticalCenter: parent.verticalCenter; text: 'Row ' + index; color: 'white' } } } } }\n";
}

struct Result {
    double frameMs = 0;
    int drawn = 0;
};

Result run(bool cull, int frames)
{
    QQuickView view;
    QQuickItem *root = showDocument(view, document(cull), QStringLiteral(PELKAN_QML_DIR));
    if (!root)
        return {};

    FrameWork work(view);
    QTest::qWait(100);
    work.reset();
    for (int i = 0; i < frames; ++i) {
        root->setProperty("contentY", ((i + 1) * 37) % 50000); // a new position every frame
        work.waitForFrame();
    }
    Result result;
    result.frameMs = work.msPerFrame();
    QObject *culling = root->findChild<QObject *>(QStringLiteral("cull"));
    result.drawn = culling ? culling->property("drawnCount").toInt() : 1000;
    return result;
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    QTextStream out(stdout);
    // Alternating rounds; the median of each.
    std::vector<double> with, without;
    int drawnWith = 0;
    for (int round = 0; round < 3; ++round) {
        const Result culled = run(true, 120);
        const Result plain = run(false, 120);
        with.push_back(culled.frameMs);
        without.push_back(plain.frameMs);
        drawnWith = culled.drawn;
    }
    std::sort(with.begin(), with.end());
    std::sort(without.begin(), without.end());
    out << QStringLiteral("1000-row Column, work per frame while scrolling (median of 3 runs):\n"
                          "  with VisibilityCull %1 ms (%2 rows drawn), without %3 ms (1000 rows): %4x faster, %5x fewer rows\n")
               .arg(with[1], 0, 'f', 2).arg(drawnWith).arg(without[1], 0, 'f', 2)
               .arg(without[1] / with[1], 0, 'f', 2).arg(1000.0 / qMax(1, drawnWith), 0, 'f', 1);
    return 0;
}
