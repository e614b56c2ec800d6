#pragma once

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QQuickWindow>
#include <QTest>

#include <atomic>

// The work of each frame of a window, from synchronising the scene to the swap, for
// benchmarks that change something once per frame and wait for its frame.
class FrameWork
{
public:
    explicit FrameWork(QQuickWindow &window)
    {
        m_clock.start();
        m_sync = QObject::connect(&window, &QQuickWindow::beforeSynchronizing, &window,
                                  [this] { m_syncStart = m_clock.nsecsElapsed(); }, Qt::DirectConnection);
        m_swap = QObject::connect(&window, &QQuickWindow::frameSwapped, &window, [this] {
            m_total += m_clock.nsecsElapsed() - m_syncStart;
            ++m_frames;
        }, Qt::DirectConnection);
    }

    // The window may outlive the measurement and go on drawing.
    ~FrameWork()
    {
        QObject::disconnect(m_sync);
        QObject::disconnect(m_swap);
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
    QMetaObject::Connection m_sync;
    QMetaObject::Connection m_swap;
    std::atomic<qint64> m_syncStart { 0 };
    std::atomic<qint64> m_total { 0 };
    std::atomic<int> m_frames { 0 };
};

// Lets the window settle, then makes step(i) change the scene for i = 0 .. steps - 1, one
// frame each: the work per frame over those frames.
template <typename Step>
double msPerStep(QQuickWindow &window, int steps, Step step)
{
    FrameWork work(window);
    QTest::qWait(100);
    work.reset();
    for (int i = 0; i < steps; ++i) {
        step(i);
        work.waitForFrame();
    }
    return work.msPerFrame();
}
