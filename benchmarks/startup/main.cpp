// Start-up time and resident memory of a real first page: from the creation of the QML
// engine to the first frame on screen in which every visible row of the list is drawn,
// for the same application (window, page stack, a page with a header and a 50-row list)
// written with
//   - Quorvane Pelkan: ApplicationWindow, PageHeader, ListItem rows with a Label;
//   - the plain floor: Window, an Item page, a Text header and Item + Text rows, no toolkit;
//   - Qt Quick Controls 2: ApplicationWindow, StackView, ToolBar, ItemDelegate rows;
//   - Kirigami: ApplicationWindow, ScrollablePage, BasicListItem rows;
// all in the same sizes. Then the memory after 100 immediate push + pop cycles of that page,
// each to its drawn frame, for the three toolkits.
//
//   pelkan-startup-bench [--runs N]     runs every document N times, each in a fresh process
//                                       (modules load once per process), interleaved, and
//                                       prints medians and ratios
//   pelkan-startup-bench --once DOC     one measurement; prints "ms rss-mb"
//   pelkan-startup-bench --cycles DOC N resident memory at the first frame and after N
//                                       push + pop cycles; prints "rss-mb rss-mb"

#include "../common/rows.h"
#include "../common/summary.h"

#include <QElapsedTimer>
#include <QFile>
#include <QGuiApplication>
#include <QProcess>
#include <QQmlApplicationEngine>
#include <QQmlContext>
#include <QQmlExpression>
#include <QQuickWindow>
#include <QScreen>
#include <QTextStream>
#include <QTimer>

#include <algorithm>
#include <atomic>
#include <functional>
#include <memory>
#include <map>
#include <unistd.h>
#include <vector>

namespace {

// "pelkan-uncompiled" is the Pelkan document with the engine told to ignore compiled units
// (the components' .qmlc files and its own cache): what precompiling saves.
const char *const Documents[] = { "pelkan", "plain", "qqc2", "kirigami", "pelkan-uncompiled" };

// How each toolkit pushes its page again and pops it, both without animation where it has
// the choice, evaluated in the document's own scope.
struct Cycle {
    const char *document;
    const char *push;
    const char *pop;
};
const Cycle Cycles[] = {
    { "pelkan", "pageStack.push(initialPage, {}, PageStackAction.Immediate)", "pageStack.pop(PageStackAction.Immediate)" },
    { "qqc2", "stack.push(page, {}, StackView.Immediate)", "stack.pop(StackView.Immediate)" },
    { "kirigami", "pageStack.push(page)", "pageStack.pop()" },
};

double residentMegabytes()
{
    QFile statm(QStringLiteral("/proc/self/statm"));
    if (!statm.open(QIODevice::ReadOnly))
        return 0;
    const QList<QByteArray> fields = statm.readAll().split(' ');
    return fields.size() > 1 ? fields.at(1).toDouble() * double(sysconf(_SC_PAGESIZE)) / (1024.0 * 1024.0) : 0;
}

QQuickWindow *firstQuickWindow()
{
    for (QWindow *window : QGuiApplication::topLevelWindows()) {
        if (auto quick = qobject_cast<QQuickWindow *>(window))
            return quick;
    }
    return nullptr;
}

// Loads the document and runs `drawn` on the GUI thread once the first frame with every
// visible row is on screen; returns the exit code of the event loop.
int loadAndWait(QQmlApplicationEngine &engine, const QString &name, const std::function<void(QQuickWindow *)> &drawn)
{
    engine.addImportPath(QStringLiteral(PELKAN_QML_DIR));
    engine.load(QUrl::fromLocalFile(QStringLiteral(DOCUMENTS_DIR "/") + name + QStringLiteral(".qml")));
    if (engine.rootObjects().isEmpty()) {
        QTextStream(stderr) << "cannot load " << name << "\n";
        return 1;
    }
    // Each document's root makes or is its window, possibly a moment after loading. The
    // rows are checked while the scene is synchronised (the GUI thread waits then), and
    // the frame made from that scene ends the measurement when it is swapped.
    struct State {
        std::atomic<bool> complete { false };
        std::atomic<bool> done { false };
        QMetaObject::Connection synchronized, swapped;
    };
    auto state = std::make_shared<State>();
    QTimer poll;
    QObject::connect(&poll, &QTimer::timeout, [&poll, state, drawn] {
        QQuickWindow *quick = firstQuickWindow();
        if (!quick)
            return;
        poll.stop();
        state->synchronized = QObject::connect(quick, &QQuickWindow::afterSynchronizing, quick, [state, quick] {
            state->complete = Rows::allDrawn(quick);
        }, Qt::DirectConnection);
        state->swapped = QObject::connect(quick, &QQuickWindow::frameSwapped, quick, [state, quick, drawn] {
            if (state->done)
                return;
            if (!state->complete) {
                QMetaObject::invokeMethod(quick, "update", Qt::QueuedConnection);
                return;
            }
            state->done = true;
            QObject::disconnect(state->synchronized);
            QObject::disconnect(state->swapped);
            drawn(quick);
        }, Qt::DirectConnection);
    });
    poll.start(0);
    QTimer::singleShot(30000, [] { QCoreApplication::exit(1); });
    return QGuiApplication::exec();
}

int measureOnce(const QString &name)
{
    QElapsedTimer timer;
    timer.start();
    QQmlApplicationEngine engine;
    return loadAndWait(engine, name, [&timer](QQuickWindow *) {
        const double ms = double(timer.nsecsElapsed()) / 1e6;
        QTextStream(stdout) << ms << ' ' << residentMegabytes() << Qt::endl;
        QMetaObject::invokeMethod(qApp, [] { QCoreApplication::exit(0); }, Qt::QueuedConnection);
    });
}

// Grabs frames until every visible row is drawn (five seconds at the most).
bool drawRows(QQuickWindow *window)
{
    QElapsedTimer waited;
    waited.start();
    for (;;) {
        window->grabWindow();
        if (Rows::allDrawn(window))
            return true;
        if (waited.elapsed() > 5000)
            return false;
        QCoreApplication::processEvents(QEventLoop::AllEvents, 5);
    }
}

int measureCycles(const QString &name, int count)
{
    const Cycle *cycle = std::find_if(std::begin(Cycles), std::end(Cycles),
                                      [&](const Cycle &c) { return name == QLatin1String(c.document); });
    if (cycle == std::end(Cycles))
        return 1;
    QQmlApplicationEngine engine;
    double first = 0;
    QQuickWindow *shown = nullptr;
    const int code = loadAndWait(engine, name, [&](QQuickWindow *window) {
        first = residentMegabytes();
        shown = window;
        QMetaObject::invokeMethod(qApp, [] { QCoreApplication::exit(0); }, Qt::QueuedConnection);
    });
    if (code != 0 || !shown)
        return 1;
    QObject *root = engine.rootObjects().first();
    QQmlExpression push(qmlContext(root), root, QString::fromLatin1(cycle->push));
    QQmlExpression pop(qmlContext(root), root, QString::fromLatin1(cycle->pop));
    for (int i = 0; i < count; ++i) {
        push.evaluate();
        const bool pushed = drawRows(shown);
        pop.evaluate();
        if (push.hasError() || pop.hasError() || !pushed || !drawRows(shown)) {
            QTextStream(stderr) << name << ": cycle " << i << " failed " << push.error().toString()
                                << pop.error().toString() << "\n";
            return 1;
        }
    }
    // What stays: deferred deletions done and the script heap collected.
    QTimer::singleShot(200, [] { QCoreApplication::exit(0); });
    QGuiApplication::exec();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    engine.collectGarbage();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    shown->grabWindow();
    QTextStream(stdout) << first << ' ' << residentMegabytes() << Qt::endl;
    return 0;
}

double median(std::vector<double> values)
{
    std::sort(values.begin(), values.end());
    const size_t n = values.size();
    return n % 2 ? values[n / 2] : (values[n / 2 - 1] + values[n / 2]) / 2;
}

// Runs this program with the arguments in a fresh process; the numbers of its first line.
QList<double> child(const QString &program, const QString &document, const QStringList &arguments)
{
    QProcess process;
    QString name = document;
    if (name.endsWith(QLatin1String("-uncompiled"))) {
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.insert(QStringLiteral("QML_DISABLE_DISK_CACHE"), QStringLiteral("1"));
        process.setProcessEnvironment(environment);
        name.chop(int(qstrlen("-uncompiled")));
    }
    QStringList all = arguments;
    all.insert(1, name);
    process.start(program, all);
    if (!process.waitForFinished(120000) || process.exitCode() != 0) {
        QTextStream(stderr) << "failed: " << document << " " << process.readAllStandardError() << "\n";
        return {};
    }
    QList<double> numbers;
    for (const QByteArray &field : process.readAllStandardOutput().split('\n').first().split(' '))
        numbers << field.toDouble();
    return numbers;
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    const QStringList args = app.arguments();
    const int once = args.indexOf(QStringLiteral("--once"));
    if (once > 0 && once + 1 < args.size())
        return measureOnce(args.at(once + 1));
    const int cycles = args.indexOf(QStringLiteral("--cycles"));
    if (cycles > 0 && cycles + 2 < args.size())
        return measureCycles(args.at(cycles + 1), args.at(cycles + 2).toInt());

    const int runsAt = args.indexOf(QStringLiteral("--runs"));
    const int runs = runsAt > 0 && runsAt + 1 < args.size() ? args.at(runsAt + 1).toInt() : 15;
    const QString self = app.applicationFilePath();

    QTextStream out(stdout);
    // The peers' pages are written in the theme's sizes at ratio 1, which the theme takes
    // on a 540-pixel-wide screen; on a wider one the toolkit's rows grow and fewer show.
    if (QScreen *screen = QGuiApplication::primaryScreen()) {
        if (screen->size().width() != 540)
            out << "Note: the screen is " << screen->size().width() << " pixels wide, not 540: the toolkit's page is "
                << "drawn at a larger theme scale than the others\n";
    }
    std::map<QString, std::vector<double>> times, memory;
    // One warm-up round fills the disk cache for every document alike.
    for (int round = -1; round < runs; ++round) {
        for (const char *document : Documents) {
            const QList<double> result = child(self, QString::fromLatin1(document), { QStringLiteral("--once") });
            if (result.size() < 2)
                return 1;
            if (round >= 0) {
                times[QString::fromLatin1(document)].push_back(result.at(0));
                memory[QString::fromLatin1(document)].push_back(result.at(1));
            }
        }
    }

    const double ours = median(times["pelkan"]);
    const double plain = median(times["plain"]);
    out << "Start-up to the first frame with every visible row drawn, median of " << runs
        << " fresh processes each (window, page stack, header, 50-row list):\n";
    for (const char *document : Documents) {
        const std::vector<double> &values = times[QString::fromLatin1(document)];
        const double m = median(values);
        out << QStringLiteral("  %1 %2 ms (min %3, max %4), Pelkan %5x this, %6 MB resident\n")
                   .arg(QString::fromLatin1(document), -18)
                   .arg(m, 7, 'f', 1)
                   .arg(*std::min_element(values.begin(), values.end()), 0, 'f', 1)
                   .arg(*std::max_element(values.begin(), values.end()), 0, 'f', 1)
                   .arg(ours / m, 0, 'f', 2)
                   .arg(median(memory[QString::fromLatin1(document)]), 0, 'f', 1);
    }
    const double qqc2 = median(times["qqc2"]);
    const double kirigami = median(times["kirigami"]);
    Summary::row(QStringLiteral("start-up, ListItem+Label page vs plain Item+Text page"), Summary::ms(ours),
                 Summary::ms(plain), ours / plain, Summary::AtMost, 1.03);
    Summary::row(QStringLiteral("start-up, ListItem+Label vs QQC2 ItemDelegate page"), Summary::ms(ours),
                 Summary::ms(qqc2), ours / qqc2);
    Summary::row(QStringLiteral("start-up, ListItem+Label vs Kirigami BasicListItem page"), Summary::ms(ours),
                 Summary::ms(kirigami), ours / kirigami);

    const double oursMb = median(memory["pelkan"]);
    const double plainMb = median(memory["plain"]);
    const double qqc2Mb = median(memory["qqc2"]);
    out << QStringLiteral("Resident memory at that frame over the plain page's %1 MB: Pelkan +%2 MB, Qt Quick Controls 2 +%3 MB, "
                          "Kirigami +%4 MB\n")
               .arg(plainMb, 0, 'f', 1).arg(oursMb - plainMb, 0, 'f', 1).arg(qqc2Mb - plainMb, 0, 'f', 1)
               .arg(median(memory["kirigami"]) - plainMb, 0, 'f', 1);
    Summary::row(QStringLiteral("memory at first frame, cost over plain page vs QQC2's"), Summary::mb(oursMb - plainMb),
                 Summary::mb(qqc2Mb - plainMb), (oursMb - plainMb) / (qqc2Mb - plainMb));

    // Memory after push + pop cycles, three fresh processes each, alternating.
    const int count = 100;
    std::map<QString, std::vector<double>> after, growth;
    for (int round = 0; round < 3; ++round) {
        for (const Cycle &cycle : Cycles) {
            const QList<double> result = child(self, QString::fromLatin1(cycle.document),
                                               { QStringLiteral("--cycles"), QString::number(count) });
            if (result.size() < 2)
                return 1;
            after[QString::fromLatin1(cycle.document)].push_back(result.at(1));
            growth[QString::fromLatin1(cycle.document)].push_back(result.at(1) - result.at(0));
        }
    }
    out << QStringLiteral("Resident memory after %1 immediate push + pop cycles, each to its drawn frame (median of 3):\n").arg(count);
    for (const Cycle &cycle : Cycles) {
        const QString name = QString::fromLatin1(cycle.document);
        out << QStringLiteral("  %1 %2 MB (%3 MB over its first frame, %4 MB over the plain page's first frame)\n")
                   .arg(name, -10).arg(median(after[name]), 0, 'f', 1).arg(median(growth[name]), 0, 'f', 1)
                   .arg(median(after[name]) - plainMb, 0, 'f', 1);
    }
    const double oursAfter = median(after["pelkan"]) - plainMb;
    const double qqc2After = median(after["qqc2"]) - plainMb;
    Summary::row(QStringLiteral("memory after 100 push+pop, cost over plain page vs StackView's"), Summary::mb(oursAfter),
                 Summary::mb(qqc2After), oursAfter / qqc2After);
    return 0;
}
