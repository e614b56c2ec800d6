// Frosted glass over a scene that changes every frame, in one process, alternating rounds:
// the work per frame (synchronising to swap) of
// - one GlassBackgroundBase over an OverlayBackgroundSource against the same look stacked
//   from ShaderEffectSource + FastBlur + OpacityMask + a tinted Rectangle (QtGraphicalEffects);
// - three popups sharing the window's one OverlayBackgroundSource (OverlayBackground) against
//   three that each capture and blur the scene behind them that way.
// Prints medians and the ratios.

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

const QByteArray Scene = "  Item { id: content; anchors.fill: parent\n"
                         "    Repeater { model: 12; Rectangle { y: index * 80; width: 540; height: 78; color: index % 2 ? '#335' : '#553'\n"
                         "      Text { x: 20; y: 20; text: 'Row ' + index; color: 'white'; font.pixelSize: 30 } } }\n"
                         "    Rectangle { id: ball; width: 120; height: 120; radius: 60; y: 420; color: '#4db8ff' } }\n";

const QList<QRect> OnePanel { QRect(60, 300, 420, 300) };
const QList<QRect> ThreePanels { QRect(40, 100, 460, 180), QRect(40, 400, 460, 180), QRect(40, 700, 460, 180) };

QByteArray geometry(const QRect &r)
{
    return QStringLiteral("x: %1; y: %2; width: %3; height: %4").arg(r.x()).arg(r.y()).arg(r.width()).arg(r.height()).toLatin1();
}

QByteArray document(bool pelkan, const QList<QRect> &panels)
{
    QByteArray doc = pelkan ? "import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0\n"
                            : "import QtQuick 2.6\nimport QtGraphicalEffects 1.0\n";
    doc += "Item { width: 540; height: 960; property alias ballX: ball.x\n" + Scene;
    if (pelkan)
        doc += "  OverlayBackgroundSource { id: source; sourceItem: content }\n";
    for (const QRect &r : panels) {
        if (pelkan && panels.size() == 1) {
            doc += "  GlassBackgroundBase { " + geometry(r) + "; backdrop: source; radius: 24; patternOpacity: 0\n"
                   "    color: Qt.rgba(0, 0, 0, 0.4) }\n";
        } else if (pelkan) {
            doc += "  Item { " + geometry(r) + "; OverlayBackground.enabled: true; OverlayBackground.radius: 24\n"
                   "    OverlayBackground.color: Qt.rgba(0, 0, 0, 0.4) }\n";
        } else {
            const QByteArray n = QByteArray::number(r.y());
            doc += "  Item { " + geometry(r) + "\n"
                   "    ShaderEffectSource { id: capture" + n + "; anchors.fill: parent; sourceItem: content; visible: false\n"
                   "      sourceRect: Qt.rect(parent.x, parent.y, parent.width, parent.height) }\n"
                   "    FastBlur { id: blurred" + n + "; anchors.fill: parent; source: capture" + n + "; radius: 32; visible: false }\n"
                   "    Rectangle { id: shape" + n + "; anchors.fill: parent; radius: 24; visible: false }\n"
                   "    OpacityMask { anchors.fill: parent; source: blurred" + n + "; maskSource: shape" + n + " }\n"
                   "    Rectangle { anchors.fill: parent; radius: 24; color: Qt.rgba(0, 0, 0, 0.4) } }\n";
        }
    }
    return doc + "}\n";
}

double run(bool pelkan, const QList<QRect> &panels)
{
    QQuickView view;
    QQuickItem *root = showDocument(view, document(pelkan, panels), QStringLiteral(PELKAN_QML_DIR));
    if (!root)
        return 0;
    return msPerStep(view, 120, [root](int i) { root->setProperty("ballX", (i * 9) % 420); });
}

void compare(const QList<QRect> &panels, const QString &what, const QString &peer)
{
    std::vector<double> ours, theirs;
    for (int round = 0; round < 5; ++round) {
        ours.push_back(run(true, panels));
        theirs.push_back(run(false, panels));
    }
    QTextStream(stdout) << QStringLiteral("%1, work per frame (median of 5): ours %2 ms, %3 %4 ms, %5x\n")
                               .arg(what).arg(median(ours), 0, 'f', 2).arg(peer).arg(median(theirs), 0, 'f', 2)
                               .arg(median(ours) / median(theirs), 0, 'f', 2);
    Summary::row(what + QStringLiteral(" vs ") + peer, Summary::ms(median(ours)), Summary::ms(median(theirs)),
                 median(ours) / median(theirs));
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    compare(OnePanel, QStringLiteral("Glass over a blurred, changing backdrop"),
            QStringLiteral("ShaderEffectSource + FastBlur + OpacityMask + Rectangle"));
    compare(ThreePanels, QStringLiteral("Three frosted popups sharing one capture"),
            QStringLiteral("three each capturing and blurring"));
    return 0;
}
