#pragma once

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QQuickWindow>

#include <atomic>

// The work of each frame of a window, from synchronising the scene to the swap, for
// benchmarks that change something once per frame and wait for its frame.
class FrameWork
{
public:
    explicit FrameWork(QQuickWindow &window)
    {
        m_clock.start();
        QObject::connect(&window, &QQuickWindow::beforeSynchronizing, &window,
                         [this] { m_syncStart = m_clock.nsecsElapsed(); }, Qt::DirectConnection);
        QObject::connect(&window, &QQuickWindow::frameSwapped, &window, [this] {
            m_total += m_clock.nsecsElapsed() - m_syncStart;
            ++m_frames;
        }, Qt::DirectConnection);
    }

    void reset()
    {
        m_total = 0;
        m_frames = 0;
    }

    // Waits for the next frame, a second at the most.
    void waitForFrame()
    {
        const int seen = m_frames;
        QElapsedTimer waited;
        waited.start();
        while (m_frames == seen && waited.elapsed() < 1000)
            QCoreApplication::processEvents(QEventLoop::AllEvents, 5);
    }

    double msPerFrame() const { return double(m_total) / 1e6 / qMax(1, int(m_frames)); }

private:
    QElapsedTimer m_clock;
    std::atomic<qint64> m_syncStart { 0 };
    std::atomic<qint64> m_total { 0 };
    std::atomic<int> m_frames { 0 };
};
