// Cost per move of the page stack's child filter, the window's event hub and the bounce
// effect's window handler: a stream of 10 000 moves scrolls a 60-row list inside a window
// item, a page stack, a page container and a page, with a bounce effect, against the same
// list in a plain window, in one process, alternating rounds. Once with mouse moves, in
// which Qt Quick also looks for the cursor shape under the pointer through the whole item
// tree on every move, and once with touch moves as a touch screen sends them (delivered
// one by one, as with QML_NO_TOUCH_COMPRESSION). Prints the time per move of each and the
// ratios.

#include "../common/summary.h"

#include "../common/median.h"

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTextStream>
#include <QTouchDevice>
#include <QTouchEvent>
#include <qpa/qwindowsysteminterface.h>

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
// Nanoseconds per move for one press, `moves` moves up and down the list, one release,
// as mouse events or as the touch events of one finger.
double nanosPerMove(QQuickWindow *window, int moves, bool touch)
{
    static QTouchDevice *const screen = [] {
        auto device = new QTouchDevice;
        device->setType(QTouchDevice::TouchScreen);
        QWindowSystemInterface::registerTouchDevice(device);
        return device;
    }();
    auto send = [window, touch](QEvent::Type type, const QPointF &pos) {
        if (touch) {
            QTouchEvent::TouchPoint point(1);
            const Qt::TouchPointState state = type == QEvent::MouseButtonPress ? Qt::TouchPointPressed
                    : type == QEvent::MouseMove ? Qt::TouchPointMoved : Qt::TouchPointReleased;
            point.setState(state);
            point.setPos(pos);
            point.setScenePos(pos);
            point.setScreenPos(window->mapToGlobal(pos.toPoint()));
            const QEvent::Type touchType = type == QEvent::MouseButtonPress ? QEvent::TouchBegin
                    : type == QEvent::MouseMove ? QEvent::TouchUpdate : QEvent::TouchEnd;
            QTouchEvent event(touchType, screen, Qt::NoModifier, state, { point });
            event.setWindow(window);
            QCoreApplication::sendEvent(window, &event);
        } else {
            const Qt::MouseButtons buttons = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
            QMouseEvent event(type, pos, pos, window->mapToGlobal(pos.toPoint()), Qt::LeftButton, buttons, Qt::NoModifier);
            QCoreApplication::sendEvent(window, &event);
        }
    };
    QElapsedTimer timer;
    send(QEvent::MouseButtonPress, QPointF(270, 800));
    timer.start();
    qreal y = 800;
    qreal step = -4;
    for (int i = 0; i < moves; ++i) {
        y += step;
        if (y < 100 || y > 880)
            step = -step;
        send(QEvent::MouseMove, QPointF(270, y));
    }
    const qint64 elapsed = timer.nsecsElapsed();
    send(QEvent::MouseButtonRelease, QPointF(270, y));
    return double(elapsed) / moves;
}

} // namespace

int main(int argc, char *argv[])
{
    qputenv("QSG_RENDER_LOOP", "basic");
    qputenv("QML_NO_TOUCH_COMPRESSION", "1");
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
    QTextStream out(stdout);
    out << QStringLiteral("Per move, %1 moves, median of 7 alternating rounds (ratio: page stack + bounce / plain):\n").arg(moves);
    for (bool touch : { false, true }) {
        std::vector<double> toolkit, plain;
        for (int round = 0; round < 7; ++round) {
            toolkit.push_back(nanosPerMove(&windows[0], moves, touch));
            plain.push_back(nanosPerMove(&windows[1], moves, touch));
            QCoreApplication::processEvents();
        }
        const double a = median(toolkit) / 1000;
        const double b = median(plain) / 1000;
        const char *what = touch ? "touch" : "mouse";
        out << QStringLiteral("  %1: page stack + bounce over the list %2 us, plain Flickable list %3 us, %4x\n")
                       .arg(QLatin1String(what)).arg(a, 0, 'f', 2).arg(b, 0, 'f', 2).arg(a / b, 0, 'f', 2);
        Summary::row(QStringLiteral("per %1 move over a list, page stack + bounce vs plain Flickable").arg(QLatin1String(what)),
                     Summary::us(a), Summary::us(b), a / b, Summary::AtMost, 1.05);
    }
    return 0;
}
