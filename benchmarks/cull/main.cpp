// A 1000-row Column scrolled a step per frame, with VisibilityCull and without, in one
// process: rows drawn and the work per frame (synchronising to swap). Twice: scrolling
// alone, and scrolling while the page fades (as during a page transition, when every
// row's vertices change with the opacity). Prints both and the ratios.

#include "../common/summary.h"
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
                      "Flickable { width: 540; height: 960; contentHeight: column.height; property int rows: 1000\n"
                      "  Column { id: column; width: parent.width\n")
            + (cull ? "    P.VisibilityCull { objectName: 'cull' }\n" : "")
            + "    Repeater { model: rows\n"
              "      Rectangle { width: column.width; height: 80; color: index % 2 ? '#223' : '#334'\n"
              "        Rectangle { x: 16; y: 16; width: 48; height: 48; radius: 8; color: '#88a' }\n"
              "        Text { x: 80; y: 12; text: 'Row ' + index; color: 'white'; font.pixelSize: 24 }\n"
              "        Text { x: 80; y: 46; text: 'The second line of row ' + index; color: '#aab'; font.pixelSize: 18 } } } } }\n";
}

struct Result {
    double frameMs = 0;
    int drawn = 0;
};

Result run(bool cull, bool fade, int frames)
{
    QQuickView view;
    QQuickItem *root = showDocument(view, document(cull), QStringLiteral(PELKAN_QML_DIR));
    if (!root)
        return {};

    Result result;
    result.frameMs = msPerStep(view, frames, [root, fade](int i) {
        root->setProperty("contentY", ((i + 1) * 37) % 50000); // a new position every frame
        if (fade)
            root->setProperty("opacity", 0.5 + 0.05 * (i % 10));
    });
    QObject *culling = root->findChild<QObject *>(QStringLiteral("cull"));
    result.drawn = culling ? culling->property("drawnCount").toInt() : 1000;
    return result;
}

void report(QTextStream &out, const char *what, bool fade)
{
    // Alternating rounds; the median of each.
    std::vector<double> with, without;
    int drawnWith = 0;
    for (int round = 0; round < 3; ++round) {
        const Result culled = run(true, fade, 120);
        const Result plain = run(false, fade, 120);
        with.push_back(culled.frameMs);
        without.push_back(plain.frameMs);
        drawnWith = culled.drawn;
    }
    std::sort(with.begin(), with.end());
    std::sort(without.begin(), without.end());
    out << QStringLiteral("  %1: with VisibilityCull %2 ms (%3 rows drawn), without %4 ms (1000 rows): %5x faster, %6x fewer rows\n")
               .arg(QLatin1String(what)).arg(with[1], 0, 'f', 2).arg(drawnWith).arg(without[1], 0, 'f', 2)
               .arg(without[1] / with[1], 0, 'f', 2).arg(1000.0 / qMax(1, drawnWith), 0, 'f', 1);
    Summary::row(QStringLiteral("1000-row column, %1, VisibilityCull vs none").arg(QLatin1String(what)),
                 Summary::ms(with[1]), Summary::ms(without[1]), with[1] / without[1]);
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    QTextStream out(stdout);
    out << "1000-row Column, work per frame (median of 3 runs):\n";
    report(out, "scrolling", false);
    report(out, "scrolling while fading", true);
    return 0;
}
