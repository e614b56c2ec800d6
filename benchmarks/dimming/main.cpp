// Dimming a page around a hole that moves each frame, in one process, alternating rounds:
// the work per frame (synchronising to swap) of a DimmedRegion against a Rectangle cut by
// an inverted OpacityMask (QtGraphicalEffects). Prints medians and the ratio.

#include "../common/summary.h"
#include "../common/documentview.h"
#include "../common/framework.h"
#include "../common/median.h"

#include <QGuiApplication>
#include <QQuickItem>
#include <QQuickView>
#include <QTest>
#include <QTextStream>

namespace {

const QByteArray Page = "  Repeater { model: 12; Rectangle { y: index * 80; width: 540; height: 78; color: index % 2 ? '#335' : '#553'\n"
                        "    Text { x: 20; y: 20; text: 'Row ' + index; color: 'white'; font.pixelSize: 30 } } }\n"
                        "  Item { id: target; x: 100; width: 300; height: 120 }\n";

QByteArray document(bool pelkan)
{
    if (pelkan)
        return "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n"
               "Item { width: 540; height: 960; property alias holeY: target.y\n" + Page
               + "  DimmedRegion { anchors.fill: parent; color: Qt.rgba(0, 0, 0, 0.6); holes: [target]; radius: 16 } }\n";
    return "import QtQuick 2.6\nimport QtGraphicalEffects 1.0\n"
           "Item { width: 540; height: 960; property alias holeY: target.y\n" + Page
           + "  Rectangle { id: dim; anchors.fill: parent; color: Qt.rgba(0, 0, 0, 0.6); visible: false }\n"
             "  Item { id: mask; anchors.fill: parent; visible: false\n"
             "    Rectangle { x: target.x; y: target.y; width: target.width; height: target.height; radius: 16 } }\n"
             "  OpacityMask { anchors.fill: parent; source: dim; maskSource: mask; invert: true } }\n";
}

double run(bool pelkan)
{
    QQuickView view;
    QQuickItem *root = showDocument(view, document(pelkan), QStringLiteral(PELKAN_QML_DIR));
    if (!root)
        return 0;
    return msPerStep(view, 120, [root](int i) { root->setProperty("holeY", (i * 7) % 800); });
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    std::vector<double> ours, theirs;
    for (int round = 0; round < 5; ++round) {
        ours.push_back(run(true));
        theirs.push_back(run(false));
    }
    QTextStream(stdout) << QStringLiteral("Dimming around a moving hole, work per frame (median of 5): DimmedRegion %1 ms, "
                                          "Rectangle + OpacityMask %2 ms, %3x\n")
                               .arg(median(ours), 0, 'f', 2).arg(median(theirs), 0, 'f', 2)
                               .arg(median(ours) / median(theirs), 0, 'f', 2);
    Summary::row(QStringLiteral("dimming around a moving hole vs Rectangle+OpacityMask"), Summary::ms(median(ours)),
                 Summary::ms(median(theirs)), median(ours) / median(theirs));
    return 0;
}
