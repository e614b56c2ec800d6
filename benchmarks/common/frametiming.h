#pragma once

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QGuiApplication>
#include <QQuickView>
#include <QTextStream>

#include <functional>

// Shows the view and redraws it continuously; after 30 frames to settle, times 200 and
// prints "frame-ms <milliseconds per frame>". settled runs once the timing starts.
inline int timeFrames(QQuickView &view, const std::function<void()> &settled = {})
{
    int frames = 0;
    QElapsedTimer timer;
    QObject::connect(&view, &QQuickWindow::frameSwapped, &view, [&] {
        if (++frames == 30) {
            timer.start();
            if (settled)
                settled();
        }
        if (frames == 230) {
            QTextStream(stdout) << "frame-ms " << timer.nsecsElapsed() / 1e6 / 200 << Qt::endl;
            QCoreApplication::exit(0);
        }
        view.update();
    });
    view.show();
    return QGuiApplication::exec();
}
