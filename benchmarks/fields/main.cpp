// Text components, in one process, alternating rounds:
//  - creating a page of 200 text fields and 200 labels until its first frame is on screen,
//    Pelkan's TextField and Label against Qt Quick Controls 2's;
//  - the work per frame (synchronising to swap) while a column of 40 long labels scrolls,
//    fading labels against eliding ones.
// Prints medians and ratios (below 1: Pelkan, or the fade, is cheaper).

#include "../common/summary.h"
#include "../common/documentview.h"
#include "../common/framework.h"
#include "../common/median.h"

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickView>
#include <QTest>
#include <QTextStream>

#include <algorithm>
#include <vector>

namespace {

QByteArray formDocument(bool pelkan)
{
    const QByteArray imports = pelkan ? "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n"
                                      : "import QtQuick 2.6\nimport QtQuick.Controls 2.15\n";
    return imports + "Column { width: 540\n"
                     "  Repeater { model: 200\n"
                     "    Column { width: 540\n"
                     "      Label { width: 540; text: 'Label ' + index }\n"
                     "      TextField { width: 540; placeholderText: 'Field ' + index } } } }\n";
}

QByteArray labelsDocument(bool fade)
{
    return QByteArray("import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n"
                      "Flickable { width: 540; height: 960; contentHeight: column.height\n"
                      "  Column { id: column; width: 540\n"
                      "    Repeater { model: 40\n"
                      "      Label { width: 500; x: 20; height: 80; truncationMode: TruncationMode.")
            + (fade ? "Fade" : "Elide")
            + "\n        text: 'A label far too long for its row, number ' + index + ', that does not fit' } } } }\n";
}

// Milliseconds from creating the page to its first frame swapped.
double createOnce(QQuickView &view, QQmlComponent &component)
{
    int swapped = 0;
    const auto connection = QObject::connect(&view, &QQuickWindow::frameSwapped, [&] { ++swapped; });
    QElapsedTimer timer;
    timer.start();
    auto *page = qobject_cast<QQuickItem *>(component.create());
    if (!page) {
        QTextStream(stderr) << component.errorString();
        return 0;
    }
    page->setParentItem(view.contentItem());
    view.update();
    while (swapped == 0 && timer.elapsed() < 5000)
        QCoreApplication::processEvents(QEventLoop::AllEvents, 5);
    const double ms = timer.nsecsElapsed() / 1e6;
    QObject::disconnect(connection);
    delete page;
    QCoreApplication::processEvents();
    return ms;
}

double scrollFrames(bool fade)
{
    QQuickView view;
    QQuickItem *root = showDocument(view, labelsDocument(fade), QStringLiteral(PELKAN_QML_DIR));
    if (!root)
        return 0;
    return msPerStep(view, 120, [root](int i) { root->setProperty("contentY", ((i + 1) * 23) % 2400); });
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    QTextStream out(stdout);

    QQuickView ours, theirs;
    for (QQuickView *view : { &ours, &theirs }) {
        view->engine()->addImportPath(QStringLiteral(PELKAN_QML_DIR));
        view->resize(540, 960);
        view->show();
        QTest::qWaitForWindowExposed(view);
    }
    QQmlComponent ourForm(ours.engine()), theirForm(theirs.engine());
    ourForm.setData(formDocument(true), QUrl());
    theirForm.setData(formDocument(false), QUrl());
    createOnce(ours, ourForm); // types loaded, caches warm
    createOnce(theirs, theirForm);
    std::vector<double> ourTimes, theirTimes;
    for (int round = 0; round < 15; ++round) {
        ourTimes.push_back(createOnce(ours, ourForm));
        theirTimes.push_back(createOnce(theirs, theirForm));
    }
    out << QStringLiteral("Page of 200 text fields and 200 labels, created to first frame (median of 15): "
                          "Pelkan %1 ms, Qt Quick Controls 2 %2 ms, %3x\n")
               .arg(median(ourTimes), 0, 'f', 2).arg(median(theirTimes), 0, 'f', 2)
               .arg(median(ourTimes) / median(theirTimes), 0, 'f', 2);

    Summary::row(QStringLiteral("200 fields + 200 labels page to first frame vs QQC2"), Summary::ms(median(ourTimes)),
                 Summary::ms(median(theirTimes)), median(ourTimes) / median(theirTimes));

    std::vector<double> fading, eliding;
    for (int round = 0; round < 5; ++round) {
        fading.push_back(scrollFrames(true));
        eliding.push_back(scrollFrames(false));
    }
    out << QStringLiteral("40 long labels scrolled, work per frame (median of 5): fading %1 ms, eliding %2 ms, %3x\n")
               .arg(median(fading), 0, 'f', 2).arg(median(eliding), 0, 'f', 2)
               .arg(median(fading) / median(eliding), 0, 'f', 2);
    Summary::row(QStringLiteral("40 long labels scrolled, fading vs eliding"), Summary::ms(median(fading)),
                 Summary::ms(median(eliding)), median(fading) / median(eliding), Summary::AtMost, 0);
    return 0;
}
