// Page stack against Qt Quick Controls 2's StackView, in one process, alternating rounds:
// an immediate push, and the pop that undoes it, each until the first frame in which every
// visible row of the page then on top is drawn (StackView's pages may finish their rows
// frames after the push returns: the clock runs until they are there); the render work per
// frame of an animated push, and of a page swipe (which StackView does not have: against
// its animated push). Each page holds a header and a 30-row list of the same plain rows.
// Prints medians and ratios (Pelkan / StackView; below 1 is faster).

#include "../common/median.h"
#include "../common/rows.h"
#include "../common/summary.h"

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

const QByteArray Rows = "ListView { objectName: 'rows'; anchors.fill: parent; anchors.topMargin: 120; model: 30\n"
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

bool load(Side &side, const QByteArray &document)
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

// Grabs the window (rendering a frame at once, the same read-back for both sides) until
// every visible row of the top page is drawn, letting queued work run in between; the
// number of frames that took.
int drawRows(Side &side)
{
    QElapsedTimer waited;
    waited.start();
    for (int grabs = 1;; ++grabs) {
        side.view.grabWindow();
        if (Rows::allDrawn(&side.view) || waited.elapsed() > 5000)
            return grabs;
        QCoreApplication::processEvents(QEventLoop::AllEvents, 1);
    }
}

struct PushPop {
    double push = 0;
    double pop = 0;
    int frames = 0; // the most frames either took to show every row
};

// Milliseconds from an immediate push to the frame with its page's rows, and from the pop
// that undoes it to the frame with the rows of the page below.
PushPop immediatePushPop(Side &side)
{
    QElapsedTimer timer;
    PushPop result;
    timer.start();
    push(side, true);
    result.frames = drawRows(side);
    result.push = double(timer.nsecsElapsed()) / 1e6;
    timer.start();
    pop(side, true);
    result.frames = std::max(result.frames, drawRows(side));
    result.pop = double(timer.nsecsElapsed()) / 1e6;
    QCoreApplication::processEvents(); // deferred deletions
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    return result;
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

// StackView's lists go on incubating rows below the view after the page is drawn; a pop
// in the meantime cancels them, and the engine says so for each one. Counted, not printed.
int s_cancelledIncubations = 0;
QtMessageHandler s_defaultHandler = nullptr;

void countCancelledIncubations(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    if (message.contains(QLatin1String("Cannot create delegate"))) {
        ++s_cancelledIncubations;
        return;
    }
    if (message.contains(QLatin1String("destroyed during incubation")))
        return;
    s_defaultHandler(type, context, message);
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    s_defaultHandler = qInstallMessageHandler(countCancelledIncubations);
    Side pelkan, stackView;
    if (!load(pelkan, pelkanDocument()) || !load(stackView, stackViewDocument()))
        return 1;

    QTextStream out(stdout);
    // Rounds alternate which side goes first.
    std::vector<double> pushOurs, pushTheirs, popOurs, popTheirs, bothOurs, bothTheirs;
    int framesOurs = 0, framesTheirs = 0;
    for (int round = 0; round < 50; ++round) {
        PushPop a, b;
        if (round % 2) {
            b = immediatePushPop(stackView);
            a = immediatePushPop(pelkan);
        } else {
            a = immediatePushPop(pelkan);
            b = immediatePushPop(stackView);
        }
        framesOurs = std::max(framesOurs, a.frames);
        framesTheirs = std::max(framesTheirs, b.frames);
        pushOurs.push_back(a.push);
        popOurs.push_back(a.pop);
        bothOurs.push_back(a.push + a.pop);
        pushTheirs.push_back(b.push);
        popTheirs.push_back(b.pop);
        bothTheirs.push_back(b.push + b.pop);
    }
    out << QStringLiteral("Immediate push and pop, each until every visible row is drawn (median of 50 alternating rounds):\n"
                          "  push %1 ms Pelkan, %2 ms StackView, %3x\n  pop  %4 ms Pelkan, %5 ms StackView, %6x\n"
                          "  both %7 ms Pelkan, %8 ms StackView, %9x\n"
                          "  (the rows took at most %10 frame(s) with Pelkan, %11 with StackView)\n")
               .arg(median(pushOurs), 0, 'f', 2).arg(median(pushTheirs), 0, 'f', 2).arg(median(pushOurs) / median(pushTheirs), 0, 'f', 2)
               .arg(median(popOurs), 0, 'f', 2).arg(median(popTheirs), 0, 'f', 2).arg(median(popOurs) / median(popTheirs), 0, 'f', 2)
               .arg(median(bothOurs), 0, 'f', 2).arg(median(bothTheirs), 0, 'f', 2)
               .arg(median(bothOurs) / median(bothTheirs), 0, 'f', 2).arg(framesOurs).arg(framesTheirs);
    if (s_cancelledIncubations > 0)
        out << QStringLiteral("  (%1 rows still incubating below the view were cancelled by pops)\n").arg(s_cancelledIncubations);
    Summary::row(QStringLiteral("immediate push, to the frame with its rows, vs StackView"), Summary::ms(median(pushOurs)),
                 Summary::ms(median(pushTheirs)), median(pushOurs) / median(pushTheirs));
    Summary::row(QStringLiteral("immediate pop, to the frame with the rows below, vs StackView"), Summary::ms(median(popOurs)),
                 Summary::ms(median(popTheirs)), median(popOurs) / median(popTheirs));

    std::vector<double> animatedOurs, animatedTheirs, swipes;
    for (int round = 0; round < 5; ++round) {
        animatedOurs.push_back(animatedPushFrames(pelkan, 1));
        animatedTheirs.push_back(animatedPushFrames(stackView, 1));
        swipes.push_back(swipeFrames(pelkan, 1));
    }
    const double animatedOur = median(animatedOurs), animatedTheir = median(animatedTheirs), swipe = median(swipes);
    out << QStringLiteral("Animated push, work per frame (median of 5 alternating rounds): %1 ms Pelkan, %2 ms StackView, %3x\n")
               .arg(animatedOur, 0, 'f', 2).arg(animatedTheir, 0, 'f', 2).arg(animatedOur / animatedTheir, 0, 'f', 2);
    out << QStringLiteral("Swipe back, work per frame: %1 ms Pelkan, against StackView's animated push %2 ms, %3x\n")
               .arg(swipe, 0, 'f', 2).arg(animatedTheir, 0, 'f', 2).arg(swipe / animatedTheir, 0, 'f', 2);
    Summary::row(QStringLiteral("animated push, render work per frame, vs StackView"), Summary::ms(animatedOur),
                 Summary::ms(animatedTheir), animatedOur / animatedTheir);
    Summary::row(QStringLiteral("swipe back, render work per frame, vs StackView animated push"), Summary::ms(swipe),
                 Summary::ms(animatedTheir), swipe / animatedTheir);
    return 0;
}
