// What the component layer looks up per item, in script against Util, in one process:
// creating 2000 menu entries that each find the menu above them (two levels up, by a
// property only menus have) and the flickable above that. Prints medians and the ratio
// (below 1: Util is cheaper).

#include "../common/summary.h"
#include "../common/median.h"

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QTextStream>

#include <algorithm>
#include <vector>

namespace {

QByteArray document(bool util)
{
    const QByteArray lookups = util
            ? "      readonly property Item menu: Private.Util.findAncestor(this, '_tapToPick')\n"
              "      readonly property Item flickable: Private.Util.findFlickable(this)\n"
            : "      readonly property Item menu: parent && parent.hasOwnProperty('_tapToPick') ? parent\n"
              "          : parent && parent.parent && parent.parent.hasOwnProperty('_tapToPick') ? parent.parent : null\n"
              "      readonly property Item flickable: { for (var p = parent; p; p = p.parent) if (p.hasOwnProperty('contentY')) return p; return null }\n";
    return "import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0 as Private\n"
           "Flickable { width: 100; height: 100\n"
           "  Column { property bool _tapToPick: true\n"
           "    Repeater { model: 2000\n"
           "      Item { width: 10; height: 1\n" + lookups + "      } } } }\n";
}

double createMs(QQmlEngine &engine, QQmlComponent &component)
{
    QElapsedTimer timer;
    timer.start();
    QObject *object = component.create();
    const double ms = timer.nsecsElapsed() / 1e6;
    if (!object)
        QTextStream(stderr) << component.errorString();
    delete object;
    engine.collectGarbage();
    return ms;
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    QQmlEngine engine;
    engine.addImportPath(QStringLiteral(PELKAN_QML_DIR));
    QQmlComponent script(&engine), util(&engine);
    script.setData(document(false), QUrl());
    util.setData(document(true), QUrl());
    createMs(engine, script);
    createMs(engine, util);
    std::vector<double> a, b;
    for (int round = 0; round < 15; ++round) {
        a.push_back(createMs(engine, script));
        b.push_back(createMs(engine, util));
    }
    QTextStream(stdout) << QStringLiteral("2000 entries finding their menu and flickable (median of 15): "
                                          "script %1 ms, Util %2 ms, %3x\n")
                               .arg(median(a), 0, 'f', 2).arg(median(b), 0, 'f', 2).arg(median(b) / median(a), 0, 'f', 2);
    Summary::row(QStringLiteral("ancestor lookups, Util vs the same walk in script"), Summary::ms(median(b)),
                 Summary::ms(median(a)), median(b) / median(a), Summary::AtMost, 0.5);
    return 0;
}
