// Page stack against Qt Quick Controls 2's StackView, in one process: an immediate push
// until its frame is on screen, the render work per frame of an animated
// push, and of a page swipe (which StackView does not have: against its animated push).
// Each page holds a header and a 30-row list. Prints times and ratios (Pelkan /
// StackView; below 1 is faster).

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickView>
#include <QStyleHints>
#include <QTest>
#include <QTextStream>

#include <algorithm>
#include <atomic>
#include <vector>

namespace {

const QByteArray Rows = "ListView { anchors.fill: parent; anchors.topMargin: 120; model: 30\n"
                        "  delegate: Text { height: 80; text: 'Row ' + index; font.pixelSize: 30 } }\n";

QByteArray pelkanDocument()
{
    return "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n"
           "ApplicationWindow { width: 540; height: 960\n"
           "  property Component page: Component { Page { PageHeader { title: 'Page' }\n" + Rows + "} }\n"
           "  readonly property bool busy: pageStack.busy\n"
           "  function pushPage(immediate) { pageStack.push(page, {}, immediate ? PageStackAction.Immediate : PageStackAction.Animated) }\n"
           "  function popPage(immediate) { pageStack.pop(immediate ? PageStackAction.Immediate : PageStackAction.Animated) }\n"
           "  initialPage: page }\n";
}

QByteArray stackViewDocument()
{
    return "import QtQuick 2.6\nimport QtQuick.Controls 2.15\n"
           "Item { width: 540; height: 960\n"
           "  readonly property bool busy: stack.busy\n"
           "  function pushPage(immediate) { stack.push(page, {}, immediate ? StackView.Immediate : StackView.Transition) }\n"
           "  function popPage(immediate) { stack.pop(immediate ? StackView.Immediate : StackView.Transition) }\n"
           "  property Component page: Component { Page { header: Label { text: 'Page'; font.pixelSize: 34; padding: 24 }\n"
           + Rows + "} }\n"
           "  StackView { id: stack; anchors.fill: parent; Component.onCompleted: push(page, {}, StackView.Immediate) } }\n";
}

struct Side {
    QQuickView view;
    QQuickItem *root = nullptr;
    QObject *stack = nullptr;
    std::vector<qint64> frames; // nanoseconds from rendering to swapping, per frame recorded
    QElapsedTimer clock;
    std::atomic<qint64> renderStart { 0 };
    std::atomic<qint64> synchronised { 0 };
    std::atomic<qint64> lastRender { 0 };
    std::atomic<int> swaps { 0 };
    bool recording = false;
};

bool load(Side &side, const QByteArray &document, bool pelkan)
{
    side.view.engine()->addImportPath(QStringLiteral(PELKAN_QML_DIR));
    QQmlComponent component(side.view.engine());
    component.setData(document, QUrl());
    side.root = qobject_cast<QQuickItem *>(component.create());
    if (!side.root) {
        QTextStream(stderr) << component.errorString();
        return false;
    }
    side.view.setContent(QUrl(), nullptr, side.root);
    side.view.resize(540, 960);
    side.view.show();
    if (!QTest::qWaitForWindowExposed(&side.view))
        return false;
    side.stack = side.root;
    side.clock.start();
    // The render thread's work for a frame: from rendering to the swap.
    QObject::connect(&side.view, &QQuickWindow::afterSynchronizing, &side.view, [&side] {
        side.synchronised = side.clock.nsecsElapsed();
    }, Qt::DirectConnection);
    QObject::connect(&side.view, &QQuickWindow::beforeRendering, &side.view, [&side] {
        side.renderStart = side.clock.nsecsElapsed();
    }, Qt::DirectConnection);
    QObject::connect(&side.view, &QQuickWindow::frameSwapped, &side.view, [&side] {
        side.lastRender = side.clock.nsecsElapsed() - side.renderStart;
        if (side.recording)
            side.frames.push_back(side.lastRender);
        ++side.swaps;
    }, Qt::DirectConnection);
    return true;
}

void push(Side &side, bool immediate)
{
    QMetaObject::invokeMethod(side.root, "pushPage", Q_ARG(QVariant, immediate));
}

void pop(Side &side, bool immediate)
{
    QMetaObject::invokeMethod(side.root, "popPage", Q_ARG(QVariant, immediate));
}

// Milliseconds of work for an immediate push to reach the screen, and for the pop that
// undoes it: the call, then polishing, synchronising and rendering the frame, done at once
// by grabbing the window (the same read-back for both sides) rather than waiting for the
// frame's turn. Median of count rounds.
double immediatePushes(Side &side, int count)
{
    std::vector<double> rounds;
    QElapsedTimer timer;
    for (int i = 0; i < count; ++i) {
        timer.start();
        push(side, true);
        side.view.grabWindow();
        pop(side, true);
        side.view.grabWindow();
        rounds.push_back(double(timer.nsecsElapsed()) / 1e6);
        QCoreApplication::processEvents(); // deferred deletions
    }
    std::sort(rounds.begin(), rounds.end());
    return rounds[rounds.size() / 2];
}

// Waits for the stack to settle; false after five seconds.
bool settle(QObject *stack)
{
    QElapsedTimer waited;
    waited.start();
    while (stack->property("busy").toBool() && waited.elapsed() < 5000)
        QTest::qWait(5);
    return !stack->property("busy").toBool();
}

double meanFrame(const std::vector<qint64> &frames)
{
    if (frames.empty())
        return 0;
    double sum = 0;
    for (qint64 frame : frames)
        sum += double(frame);
    return sum / 1e6 / double(frames.size());
}

// Mean milliseconds per frame while an animated push runs, over several pushes.
double animatedPushFrames(Side &side, int count)
{
    side.frames.clear();
    for (int i = 0; i < count; ++i) {
        side.recording = true;
        push(side, false);
        settle(side.stack);
        side.recording = false;
        pop(side, true);
        settle(side.stack);
    }
    side.recording = false;
    return meanFrame(side.frames);
}

// Mean milliseconds per frame while a finger swipes a page back, one move per frame.
double swipeFrames(Side &side, int count)
{
    side.frames.clear();
    for (int i = 0; i < count; ++i) {
        push(side, true);
        side.recording = true;
        QTest::mousePress(&side.view, Qt::LeftButton, {}, QPoint(20, 500));
        for (int x = 30; x < 500; x += 10) {
            QTest::mouseMove(&side.view, QPoint(x, 500));
            side.view.update();
            QTest::qWait(16);
        }
        QTest::mouseRelease(&side.view, Qt::LeftButton, {}, QPoint(500, 500));
        side.recording = false;
        settle(side.stack);
    }
    return meanFrame(side.frames);
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    Side pelkan, stackView;
    if (!load(pelkan, pelkanDocument(), true) || !load(stackView, stackViewDocument(), false))
        return 1;

    QTextStream out(stdout);
    const double pushOurs = immediatePushes(pelkan, 50);
    const double pushTheirs = immediatePushes(stackView, 50);
    out << QStringLiteral("Immediate push and pop, each to its frame: %1 ms Pelkan, %2 ms StackView, %3x\n")
               .arg(pushOurs, 0, 'f', 2).arg(pushTheirs, 0, 'f', 2).arg(pushOurs / pushTheirs, 0, 'f', 2);
    const double animatedOurs = animatedPushFrames(pelkan, 5);
    const double animatedTheirs = animatedPushFrames(stackView, 5);
    out << QStringLiteral("Animated push, work per frame: %1 ms Pelkan, %2 ms StackView, %3x\n")
               .arg(animatedOurs, 0, 'f', 2).arg(animatedTheirs, 0, 'f', 2).arg(animatedOurs / animatedTheirs, 0, 'f', 2);
    const double swipe = swipeFrames(pelkan, 5);
    out << QStringLiteral("Swipe back, work per frame: %1 ms Pelkan, against StackView's animated push %2 ms, %3x\n")
               .arg(swipe, 0, 'f', 2).arg(animatedTheirs, 0, 'f', 2).arg(swipe / animatedTheirs, 0, 'f', 2);
    return 0;
}
