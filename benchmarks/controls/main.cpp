// Controls on their native bases against the same look rooted on a bare MouseArea (the way
// the components were written before the bases; the files in mousearea/) and against Qt
// Quick Controls 2, all in the same sizes:
//  - a page of 300 Buttons, of 100 Sliders and of 100 TextSwitches (QQC2: Button, Slider,
//    Switch) created until its first frame is on screen, in one process, alternating rounds;
//  - resident memory per control: in a fresh process for each measurement, the growth from
//    creating that page to its first frame (after a page of ten of the same controls has
//    loaded the types and drawn every glyph), divided by the number of controls;
//  - a mouse press and release on a Button: delivering both events to the window, with the
//    handlers, bindings and posted events they cause (the frames they ask for are not in it).
//
//   pelkan-controls-bench                         everything; prints medians and ratios
//   pelkan-controls-bench --memory CONTROL KIND   one memory measurement; prints KB per control
//   pelkan-controls-bench --repeat CONTROL KIND N creates that page N times, for a profiler

#include "../common/median.h"
#include "../common/summary.h"

#include <QElapsedTimer>
#include <QFile>
#include <QGuiApplication>
#include <QMouseEvent>
#include <QProcess>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickView>
#include <QTest>
#include <QTextStream>

#include <iterator>
#include <map>
#include <memory>
#include <unistd.h>
#include <vector>

namespace {

const char *const Kinds[] = { "pelkan", "mousearea", "qqc2" };

struct Control {
    const char *name;     // as the command line takes it
    const char *label;    // as the output shows it
    int count;
    const char *types[3]; // per kind, in the order of Kinds
    const char *layout;   // the page: %1 the type, %2 the count
};

const Control Controls[] = {
    { "button", "Button", 300, { "Button", "MouseAreaButton", "Button" },
      "Grid { columns: 4\n"
      "  Repeater { model: %2\n"
      "    %1 { width: 135; height: 48; text: 'Button ' + index } } }\n" },
    { "slider", "Slider", 100, { "Slider", "MouseAreaSlider", "Slider" },
      "Column { width: 540\n"
      "  Repeater { model: %2\n"
      "    %1 { width: 540; value: (index % 10) / 10 } } }\n" },
    { "switch", "TextSwitch", 100, { "TextSwitch", "MouseAreaSwitch", "Switch" },
      "Column { width: 540\n"
      "  Repeater { model: %2\n"
      "    %1 { width: 540; text: 'Switch ' + index; checked: index % 2 === 1 } } }\n" },
};

QByteArray document(const Control &control, int kind, int count)
{
    QString imports = QStringLiteral("import QtQuick 2.6\n");
    switch (kind) {
    case 0: imports += QStringLiteral("import Quorvane.Pelkan 1.0\n"); break;
    case 1: imports += QStringLiteral("import \"%1\"\n").arg(QUrl::fromLocalFile(QStringLiteral(MOUSEAREA_DIR)).toString()); break;
    default: imports += QStringLiteral("import QtQuick.Controls 2.15\n"); break;
    }
    return (imports + QString::fromLatin1(control.layout).arg(QLatin1String(control.types[kind])).arg(count)).toUtf8();
}

double residentKilobytes()
{
    QFile statm(QStringLiteral("/proc/self/statm"));
    if (!statm.open(QIODevice::ReadOnly))
        return 0;
    const QList<QByteArray> fields = statm.readAll().split(' ');
    return fields.size() > 1 ? fields.at(1).toDouble() * double(sysconf(_SC_PAGESIZE)) / 1024.0 : 0;
}

bool prepare(QQuickView &view)
{
    view.engine()->addImportPath(QStringLiteral(PELKAN_QML_DIR));
    view.resize(540, 960);
    view.show();
    return QTest::qWaitForWindowExposed(&view);
}

// Creates the page into the view and waits for its first frame; the page (null when it
// cannot be made) and the milliseconds that took.
QQuickItem *createShown(QQuickView &view, QQmlComponent &component, double *ms)
{
    int swapped = 0;
    const auto connection = QObject::connect(&view, &QQuickWindow::frameSwapped, [&] { ++swapped; });
    QElapsedTimer timer;
    timer.start();
    auto *page = qobject_cast<QQuickItem *>(component.create());
    if (page) {
        page->setParentItem(view.contentItem());
        view.update();
        while (swapped == 0 && timer.elapsed() < 5000)
            QCoreApplication::processEvents(QEventLoop::AllEvents, 5);
    } else {
        QTextStream(stderr) << component.errorString();
    }
    if (ms)
        *ms = timer.nsecsElapsed() / 1e6;
    QObject::disconnect(connection);
    return page;
}

double createOnce(QQuickView &view, QQmlComponent &component)
{
    double ms = 0;
    delete createShown(view, component, &ms);
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    return ms;
}

// The control and the kind named on the command line; false when one is not known.
bool lookUp(const QString &name, const QString &kindName, const Control **control, int *kind)
{
    *control = nullptr;
    for (const Control &candidate : Controls) {
        if (name == QLatin1String(candidate.name))
            *control = &candidate;
    }
    *kind = 0;
    while (*kind < 3 && kindName != QLatin1String(Kinds[*kind]))
        ++*kind;
    return *control && *kind < 3;
}

int repeat(const QString &name, const QString &kindName, int times)
{
    const Control *control;
    int kind;
    if (!lookUp(name, kindName, &control, &kind))
        return 2;
    QQuickView view;
    if (!prepare(view))
        return 1;
    QQmlComponent page(view.engine());
    page.setData(document(*control, kind, control->count), QUrl());
    double total = 0;
    for (int i = 0; i < times; ++i)
        total += createOnce(view, page);
    QTextStream(stdout) << total / qMax(1, times) << Qt::endl;
    return 0;
}

int measureMemory(const QString &name, const QString &kindName)
{
    const Control *control;
    int kind;
    if (!lookUp(name, kindName, &control, &kind))
        return 2;
    QQuickView view;
    if (!prepare(view))
        return 1;
    QQmlComponent warm(view.engine()), page(view.engine());
    warm.setData(document(*control, kind, 10), QUrl());
    page.setData(document(*control, kind, control->count), QUrl());
    if (createOnce(view, warm) <= 0 || page.isError())
        return 1;
    view.engine()->collectGarbage();
    QTest::qWait(50);
    const double before = residentKilobytes();
    QQuickItem *shown = createShown(view, page, nullptr);
    if (!shown)
        return 1;
    QTextStream(stdout) << (residentKilobytes() - before) / control->count << Qt::endl;
    delete shown;
    return 0;
}

// Microseconds per press and release on the first rows of buttons of the page in the view.
double pressOnce(QQuickView &view, QQuickItem *page)
{
    QList<QPointF> points;
    const QList<QQuickItem *> children = page->childItems();
    for (QQuickItem *button : children) {
        const QPointF centre = button->mapToScene(QPointF(button->width() / 2, button->height() / 2));
        if (button->width() > 0 && centre.y() < view.height())
            points.append(centre);
    }
    if (points.isEmpty())
        return 0;
    static ulong timestamp = 0;
    const int presses = 400;
    QElapsedTimer timer;
    timer.start();
    for (int i = 0; i < presses; ++i) {
        const QPointF at = points.at(i % points.size());
        QMouseEvent press(QEvent::MouseButtonPress, at, at, view.mapToGlobal(at.toPoint()), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
        press.setTimestamp(timestamp += 1000);
        QCoreApplication::sendEvent(&view, &press);
        QMouseEvent release(QEvent::MouseButtonRelease, at, at, view.mapToGlobal(at.toPoint()), Qt::LeftButton, Qt::NoButton, Qt::NoModifier);
        release.setTimestamp(timestamp += 1000);
        QCoreApplication::sendEvent(&view, &release);
        QCoreApplication::sendPostedEvents();
    }
    const double us = timer.nsecsElapsed() / 1e3 / presses;
    QTest::qWait(30);
    return us;
}

// Runs this program in a fresh process with the arguments; the number it prints, or -1.
double child(const QStringList &arguments)
{
    QProcess process;
    process.start(QCoreApplication::applicationFilePath(), arguments);
    if (!process.waitForFinished(60000) || process.exitCode() != 0) {
        QTextStream(stderr) << "failed: " << arguments.join(QLatin1Char(' ')) << " " << process.readAllStandardError() << "\n";
        return -1;
    }
    return process.readAllStandardOutput().trimmed().toDouble();
}

QString kilobytes(double value) { return QString::number(value, 'f', 1) + QStringLiteral(" KB"); }

// The two rows of one comparison: ours against the MouseArea-rooted look, against QQC2.
void rows(const QString &what, const QString &qqc2Name, double ours, double mouseArea, double qqc2,
          QString (*format)(double), double mouseAreaGoal)
{
    Summary::row(what + QStringLiteral(" vs MouseArea-rooted look"), format(ours), format(mouseArea), ours / mouseArea,
                 Summary::AtMost, mouseAreaGoal);
    Summary::row(what + QStringLiteral(" vs QQC2 ") + qqc2Name, format(ours), format(qqc2), ours / qqc2);
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    const QStringList args = app.arguments();
    const int memoryAt = args.indexOf(QStringLiteral("--memory"));
    if (memoryAt > 0 && memoryAt + 2 < args.size())
        return measureMemory(args.at(memoryAt + 1), args.at(memoryAt + 2));
    const int repeatAt = args.indexOf(QStringLiteral("--repeat"));
    if (repeatAt > 0 && repeatAt + 3 < args.size())
        return repeat(args.at(repeatAt + 1), args.at(repeatAt + 2), args.at(repeatAt + 3).toInt());
    QTextStream out(stdout);

    // Creation: one view and engine per kind, the types loaded and caches warm before timing.
    QQuickView views[3];
    for (QQuickView &view : views) {
        if (!prepare(view))
            return 1;
    }
    std::map<QString, std::vector<double>> times;
    std::vector<std::unique_ptr<QQmlComponent>> components;
    for (const Control &control : Controls) {
        for (int kind = 0; kind < 3; ++kind) {
            components.emplace_back(new QQmlComponent(views[kind].engine()));
            components.back()->setData(document(control, kind, control.count), QUrl());
            if (createOnce(views[kind], *components.back()) <= 0 || components.back()->isError())
                return 1;
        }
    }
    const int rounds = 15;
    for (int round = 0; round < rounds; ++round) {
        for (size_t c = 0; c < std::size(Controls); ++c) {
            for (int kind = 0; kind < 3; ++kind)
                times[QString::fromLatin1(Controls[c].name) + QString::number(kind)].push_back(
                    createOnce(views[kind], *components[c * 3 + kind]));
        }
    }

    // Presses on the first rows of a page of Buttons, alternating rounds.
    std::vector<double> pressTimes[3];
    QQuickItem *pages[3];
    for (int kind = 0; kind < 3; ++kind)
        pages[kind] = createShown(views[kind], *components[kind], nullptr);
    for (int kind = 0; kind < 3; ++kind)
        pressOnce(views[kind], pages[kind]);
    for (int round = 0; round < rounds; ++round) {
        for (int kind = 0; kind < 3; ++kind)
            pressTimes[kind].push_back(pressOnce(views[kind], pages[kind]));
    }
    for (QQuickItem *page : pages)
        delete page;

    // Memory: fresh processes, alternating kinds.
    const int memoryRounds = 5;
    std::map<QString, std::vector<double>> memory;
    for (int round = 0; round < memoryRounds; ++round) {
        for (const Control &control : Controls) {
            for (int kind = 0; kind < 3; ++kind) {
                const double kb = child({ QStringLiteral("--memory"), QLatin1String(control.name), QLatin1String(Kinds[kind]) });
                if (kb < 0)
                    return 1;
                memory[QString::fromLatin1(control.name) + QString::number(kind)].push_back(kb);
            }
        }
    }

    out << "Pelkan controls (native bases) against the same look rooted on a bare MouseArea and against Qt Quick "
           "Controls 2, same sizes:\n";
    for (const Control &control : Controls) {
        const QString key = QString::fromLatin1(control.name);
        double created[3], resident[3];
        for (int kind = 0; kind < 3; ++kind) {
            created[kind] = median(times[key + QString::number(kind)]);
            resident[kind] = median(memory[key + QString::number(kind)]);
        }
        out << QStringLiteral("  %1 x %2, created to first frame (median of %3): Pelkan %4 ms, MouseArea-rooted %5 ms (%6x), "
                              "QQC2 %7 %8 ms (%9x)\n")
                   .arg(control.count).arg(QLatin1String(control.label)).arg(rounds)
                   .arg(created[0], 0, 'f', 2).arg(created[1], 0, 'f', 2).arg(created[0] / created[1], 0, 'f', 2)
                   .arg(QLatin1String(control.types[2])).arg(created[2], 0, 'f', 2).arg(created[0] / created[2], 0, 'f', 2);
        out << QStringLiteral("  %1 resident memory per control (median of %2 processes): Pelkan %3 KB, MouseArea-rooted %4 KB "
                              "(%5x), QQC2 %6 KB (%7x)\n")
                   .arg(QLatin1String(control.label)).arg(memoryRounds)
                   .arg(resident[0], 0, 'f', 1).arg(resident[1], 0, 'f', 1).arg(resident[0] / resident[1], 0, 'f', 2)
                   .arg(resident[2], 0, 'f', 1).arg(resident[0] / resident[2], 0, 'f', 2);
        out.flush(); // before the summary rows, which a run by hand prints too
        const QString what = QStringLiteral("%1 x %2 page to first frame").arg(control.count).arg(QLatin1String(control.label));
        rows(what, QLatin1String(control.types[2]), created[0], created[1], created[2], Summary::ms, 1.05);
        rows(QStringLiteral("memory per %1").arg(QLatin1String(control.label)), QLatin1String(control.types[2]),
             resident[0], resident[1], resident[2], kilobytes, 1.10);
    }
    double press[3];
    for (int kind = 0; kind < 3; ++kind)
        press[kind] = median(pressTimes[kind]);
    out << QStringLiteral("  Button press + release, events delivered (median of %1 rounds of 400): Pelkan %2 us, "
                          "MouseArea-rooted %3 us (%4x), QQC2 %5 us (%6x)\n")
               .arg(rounds).arg(press[0], 0, 'f', 2).arg(press[1], 0, 'f', 2).arg(press[0] / press[1], 0, 'f', 2)
               .arg(press[2], 0, 'f', 2).arg(press[0] / press[2], 0, 'f', 2);
    out.flush();
    rows(QStringLiteral("Button press + release"), QStringLiteral("Button"), press[0], press[1], press[2], Summary::us, 1.10);
    return 0;
}
