#include "screenshotter.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QImage>
#include <QQuickWindow>
#include <QTextStream>
#include <QTimer>

// Time and frames to wait, so that images loading asynchronously and short timers (such
// as suggestions appearing after typing) are on screen.
static const int SettleMs = 500;
static const int SettleFrames = 3;
static const int TimeoutMs = 30000;

Screenshotter::Screenshotter(QQuickWindow *window, const QString &path, QObject *parent)
    : QObject(parent)
    , m_window(window)
    , m_path(QFileInfo(path).absoluteFilePath())
{
    QTimer::singleShot(SettleMs, this, [this] {
        connect(m_window, &QQuickWindow::frameSwapped, this, &Screenshotter::frameSwapped, Qt::QueuedConnection);
        m_window->update();
    });
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
