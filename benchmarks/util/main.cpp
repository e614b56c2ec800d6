// What the component layer looks up per item, in script against Util, in one process,
// alternating rounds: 2000 entries each find the nearest ancestor with a property only
// menus have and the flickable above them, the same walk on both sides (up the parent
// items, testing each for the property), as the components call it: script functions
// against Private.Util's methods. Only the lookups are timed (a loop over entries made
// beforehand), once with the menu one level and the flickable three levels up (a menu's
// entries), once four levels further down. Prints medians and ratios (below 1: Util is
// cheaper).

#include "../common/median.h"
#include "../common/summary.h"

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QTextStream>

#include <vector>

namespace {

QByteArray document(int depth)
{
    QByteArray open, close;
    for (int i = 0; i < depth; ++i) {
        open += "      Item { width: 10; height: 1\n";
        close += "      }\n";
    }
    return "import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0 as Private\n"
           "Flickable { id: root; width: 100; height: 100\n"
           "  property var entries: []\n"
           "  function ancestor(item, name) { for (var p = item.parent; p; p = p.parent) if (p.hasOwnProperty(name)) return p; return null }\n"
           "  function flickable(item) { for (var p = item.parent; p; p = p.parent) if (p.hasOwnProperty('contentY')) return p; return null }\n"
           "  function script() { var found = 0; var list = entries\n"
           "    for (var i = 0; i < list.length; ++i) if (ancestor(list[i], '_tapToPick') && flickable(list[i])) ++found\n"
           "    return found }\n"
           "  function util() { var found = 0; var list = entries\n"
           "    for (var i = 0; i < list.length; ++i)\n"
           "      if (Private.Util.findAncestor(list[i], '_tapToPick') && Private.Util.findFlickable(list[i])) ++found\n"
           "    return found }\n"
           "  Column { property bool _tapToPick: true\n"
           "    Repeater { model: 2000\n" + open
           + "      Item { width: 10; height: 1; Component.onCompleted: root.entries.push(this) }\n" + close + "} } }\n";
}

double lookupMs(QObject *root, const char *function)
{
    QElapsedTimer timer;
    timer.start();
    QVariant found;
    QMetaObject::invokeMethod(root, function, Q_RETURN_ARG(QVariant, found));
    const double ms = timer.nsecsElapsed() / 1e6;
    if (found.toInt() != 2000)
        QTextStream(stderr) << function << " found " << found.toInt() << " of 2000\n";
    return ms;
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    QQmlEngine engine;
    engine.addImportPath(QStringLiteral(PELKAN_QML_DIR));
    QTextStream out(stdout);
    for (int depth : { 0, 4 }) {
        QQmlComponent component(&engine);
        component.setData(document(depth), QUrl());
        QScopedPointer<QObject> root(component.create());
        if (!root) {
            QTextStream(stderr) << component.errorString();
            return 1;
        }
        lookupMs(root.data(), "script");
        lookupMs(root.data(), "util");
        std::vector<double> script, util;
        for (int round = 0; round < 15; ++round) {
            script.push_back(lookupMs(root.data(), "script"));
            util.push_back(lookupMs(root.data(), "util"));
        }
        const double a = median(script), b = median(util);
        out << QStringLiteral("2000 entries finding their menu (%1 up) and flickable (%2 up), median of 15: "
                              "script %3 ms, Util %4 ms, %5x\n")
                       .arg(1 + depth).arg(3 + depth).arg(a, 0, 'f', 2).arg(b, 0, 'f', 2).arg(b / a, 0, 'f', 2);
        Summary::row(QStringLiteral("ancestor lookups (%1 and %2 levels up), Util vs the same walk in script")
                             .arg(1 + depth).arg(3 + depth),
                     Summary::ms(b), Summary::ms(a), b / a, Summary::AtMost, 0.5);
    }
    return 0;
}
