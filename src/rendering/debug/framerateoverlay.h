#pragma once

#include <QElapsedTimer>
#include <QMutex>
#include <QQuickItem>
#include <QTimer>
#include <QVector>

// A debug display of how fast a window renders: frames per second over the last second
// and a graph of the last frames' times (a line at 60 Hz's 16.7 ms), drawn above
// everything else in one vertex-coloured node. Shown for every window of the toolkit when
// PELKAN_FRAME_RATE is set (not "0"), or for one window through setShown(). It redraws at
// most twice a second and only when the window drew something else meanwhile, so an idle
// window stays idle.
class FrameRateOverlay : public QQuickItem
{
    Q_OBJECT

public:
    static constexpr int History = 60;

    static bool requestedByEnvironment();
    static void setShown(QQuickWindow *window, bool shown);
    static FrameRateOverlay *find(QQuickWindow *window);

    // Frames per second and the last frame times in milliseconds (oldest first).
    int framesPerSecond() const;
    QVector<qreal> frameTimes() const;

protected:
    QSGNode *updatePaintNode(QSGNode *node, UpdatePaintNodeData *) override;

private:
    explicit FrameRateOverlay(QQuickWindow *window);
    void frameSwapped();
    void refresh();

    mutable QMutex m_mutex;    // the render thread records, the GUI thread reads
    QElapsedTimer m_clock;
    QVector<qint64> m_swaps;   // the last History + 1 swap times, in microseconds
    int m_swapsSinceRefresh = 0;
    bool m_ownFramePending = false;
    QTimer m_refresh;
};
