#include "screenshotter.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QImage>
#include <QQuickWindow>
#include <QTextStream>
#include <QTimer>

// Frames to wait so that images loaded asynchronously are on screen.
static const int SettleFrames = 3;
static const int TimeoutMs = 30000;

Screenshotter::Screenshotter(QQuickWindow *window, const QString &path, QObject *parent)
    : QObject(parent)
    , m_window(window)
    , m_path(QFileInfo(path).absoluteFilePath())
{
    connect(window, &QQuickWindow::frameSwapped, this, &Screenshotter::frameSwapped, Qt::QueuedConnection);
    QTimer::singleShot(TimeoutMs, this, [this] { fail(QStringLiteral("no frame was rendered in time")); });
}

void Screenshotter::frameSwapped()
{
    if (++m_frames < SettleFrames) {
        m_window->update();
        return;
    }
    disconnect(m_window, nullptr, this, nullptr);
    const QImage image = m_window->grabWindow();
    if (image.isNull() || !image.save(m_path, "PNG")) {
        fail(QStringLiteral("cannot write ") + m_path);
        return;
    }
    QTextStream(stdout) << "Screenshot written to " << m_path << Qt::endl;
    QCoreApplication::exit(0);
}

void Screenshotter::fail(const QString &why)
{
    QTextStream(stderr) << "Screenshot failed: " << why << Qt::endl;
    QCoreApplication::exit(1);
}
