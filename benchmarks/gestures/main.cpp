// Cost per mouse move of the page stack's child filter and the bounce effect's window
// handler: a stream of 10 000 moves scrolls a 60-row list inside a page stack with a
// bounce effect, against the same list in a plain window, in one process. Prints the
// time per move of each and the ratio.

#include "../common/summary.h"

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTextStream>

#include <algorithm>
#include <vector>

namespace {

const char *const List =
        "Flickable {\n"
        "    anchors.fill: parent; contentHeight: column.height\n"
        "    Column { id: column; width: parent.width\n"
        "        Repeater { model: 60\n"
        "            Rectangle { width: parent.width; height: 60; color: index % 2 ? '#223' : '#334'\n"
        "                Text { x: 20; anchors.verticalCenter: parent.verticalCenter; text: 'Row ' + index; color: 'white' }\n"
        "                MouseArea { anchors.fill: parent } } } } }\n";

QByteArray document(bool toolkit)
{
    QByteArray text = "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\nimport Quorvane.Pelkan.private 1.0 as P\n";
    if (toolkit) {
        text += "P.Window { width: 540; height: 960\n"
                "  PageStackBase { id: stack; anchors.fill: parent; backNavigation: true; forwardNavigation: true\n"
                "    _currentContainer: container; currentPage: page\n"
                "    Item { id: container; anchors.fill: parent\n"
                "      Item { id: page; anchors.fill: parent\n";
        text += List;
        text += "        BounceEffect { flickable: page.children[0] } } } } }\n";
    } else {
        text += "Item { width: 540; height: 960\n";
        text += List;
        text += "}\n";
    }
    return text;
}

// Nanoseconds per move for one press, `moves` moves up and down the list, one release.
double nanosPerMove(QQuickWindow *window, int moves)
{
    auto send = [window](QEvent::Type type, const QPointF &pos, Qt::MouseButtons buttons) {
        QMouseEvent event(type, pos, pos, window->mapToGlobal(pos.toPoint()), Qt::LeftButton, buttons, Qt::NoModifier);
        QCoreApplication::sendEvent(window, &event);
    };
    QElapsedTimer timer;
    send(QEvent::MouseButtonPress, QPointF(270, 800), Qt::LeftButton);
    timer.start();
    qreal y = 800;
    qreal step = -4;
    for (int i = 0; i < moves; ++i) {
        y += step;
        if (y < 100 || y > 880)
            step = -step;
        send(QEvent::MouseMove, QPointF(270, y), Qt::LeftButton);
    }
    const qint64 elapsed = timer.nsecsElapsed();
    send(QEvent::MouseButtonRelease, QPointF(270, y), Qt::NoButton);
    return double(elapsed) / moves;
}

} // namespace

int main(int argc, char *argv[])
{
    qputenv("QSG_RENDER_LOOP", "basic");
    QGuiApplication app(argc, argv);
    QQmlEngine engine;
    engine.addImportPath(QStringLiteral(PELKAN_QML_DIR));

    QQuickWindow windows[2];
    for (int i = 0; i < 2; ++i) {
        QQmlComponent component(&engine);
        component.setData(document(i == 0), QUrl());
        auto root = qobject_cast<QQuickItem *>(component.create());
        if (!root) {
            QTextStream(stderr) << component.errorString();
            return 1;
        }
        root->setParentItem(windows[i].contentItem());
        windows[i].resize(540, 960);
        windows[i].show();
    }
    QCoreApplication::processEvents();

    const int moves = 10000;
    std::vector<double> toolkit, plain;
    for (int round = 0; round < 7; ++round) {
        toolkit.push_back(nanosPerMove(&windows[0], moves));
        plain.push_back(nanosPerMove(&windows[1], moves));
        QCoreApplication::processEvents();
    }
    std::sort(toolkit.begin(), toolkit.end());
    std::sort(plain.begin(), plain.end());
    const double a = toolkit[toolkit.size() / 2];
    const double b = plain[plain.size() / 2];
    QTextStream(stdout) << QStringLiteral("Per move, %1 moves, median of 7 alternating rounds:\n"
                                          "  page stack + bounce over the list  %2 us\n"
                                          "  plain Flickable list              %3 us\n"
                                          "  ratio %4x\n")
                                   .arg(moves).arg(a / 1000, 0, 'f', 2).arg(b / 1000, 0, 'f', 2).arg(a / b, 0, 'f', 2);
    Summary::row(QStringLiteral("per mouse move over a list, page stack + bounce vs plain Flickable"), Summary::us(a / 1000),
                 Summary::us(b / 1000), a / b, Summary::AtMost, 1.05);
    return 0;
}
