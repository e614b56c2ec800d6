// Start-up time of a real first page: from the creation of the QML engine to the first
// frame on screen, for the same application (window, page stack, a page with a header and
// a 50-row list) written with Quorvane Pelkan, Qt Quick Controls 2 and Kirigami.
//
//   pelkan-startup-bench [--runs N]   runs every document N times, each in a fresh process
//                                      (modules load once per process), interleaved, and
//                                      prints medians and ratios against Pelkan
//   pelkan-startup-bench --once DOC   one measurement; prints milliseconds

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QProcess>
#include <QQmlEngine>
#include <QQmlApplicationEngine>
#include <QQuickWindow>
#include <QTextStream>
#include <QTimer>

#include <algorithm>
#include <map>
#include <vector>

// "pelkan-uncompiled" is the Pelkan document with the engine told to ignore compiled units
// (the components' .qmlc files and its own cache): what precompiling saves.
static const char *const Documents[] = { "pelkan", "pelkan-uncompiled", "qqc2", "kirigami" };

static int measureOnce(const QString &name)
{
    QElapsedTimer timer;
    timer.start();
    QQmlApplicationEngine engine;
    engine.addImportPath(QStringLiteral(PELKAN_QML_DIR));
    engine.load(QUrl::fromLocalFile(QStringLiteral(DOCUMENTS_DIR "/") + name + QStringLiteral(".qml")));
    if (engine.rootObjects().isEmpty()) {
        QTextStream(stderr) << "cannot load " << name << "\n";
        return 1;
    }
    // Each document's root makes or is its window, possibly a moment after loading: the
    // first frame of the first Qt Quick window ends the measurement.
    QTimer poll;
    QObject::connect(&poll, &QTimer::timeout, [&] {
        for (QWindow *window : QGuiApplication::topLevelWindows()) {
            auto quick = qobject_cast<QQuickWindow *>(window);
            if (!quick)
                continue;
            poll.stop();
            QObject::connect(quick, &QQuickWindow::frameSwapped, quick, [&timer] {
                QTextStream(stdout) << double(timer.nsecsElapsed()) / 1e6 << Qt::endl;
                QCoreApplication::exit(0);
            }, Qt::DirectConnection);
            return;
        }
    });
    poll.start(0);
    QTimer::singleShot(30000, [] { QCoreApplication::exit(1); });
    return QGuiApplication::exec();
}

static double median(std::vector<double> values)
{
    std::sort(values.begin(), values.end());
    const size_t n = values.size();
    return n % 2 ? values[n / 2] : (values[n / 2 - 1] + values[n / 2]) / 2;
}

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    const QStringList args = app.arguments();
    const int once = args.indexOf(QStringLiteral("--once"));
    if (once > 0 && once + 1 < args.size())
        return measureOnce(args.at(once + 1));

    const int runsAt = args.indexOf(QStringLiteral("--runs"));
    const int runs = runsAt > 0 && runsAt + 1 < args.size() ? args.at(runsAt + 1).toInt() : 15;

    QTextStream out(stdout);
    std::map<QString, std::vector<double>> times;
    // One warm-up round fills the disk cache for every document alike.
    for (int round = -1; round < runs; ++round) {
        for (const char *document : Documents) {
            QProcess child;
            QString name = QString::fromLatin1(document);
            if (name.endsWith(QLatin1String("-uncompiled"))) {
                QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
                environment.insert(QStringLiteral("QML_DISABLE_DISK_CACHE"), QStringLiteral("1"));
                child.setProcessEnvironment(environment);
                name.chop(int(qstrlen("-uncompiled")));
            }
            child.start(app.applicationFilePath(), { QStringLiteral("--once"), name });
            if (!child.waitForFinished(60000) || child.exitCode() != 0) {
                out << "failed: " << document << " " << child.readAllStandardError() << "\n";
                return 1;
            }
            if (round >= 0)
                times[QString::fromLatin1(document)].push_back(child.readAllStandardOutput().split('\n').first().toDouble());
        }
    }

    const double reference = median(times[QStringLiteral("pelkan")]);
    out << "Start-up to first frame, median of " << runs << " fresh processes each:\n";
    for (const char *document : Documents) {
        const std::vector<double> &values = times[QString::fromLatin1(document)];
        const double m = median(values);
        out << QStringLiteral("  %1 %2 ms (min %3, max %4), %5x Pelkan\n")
                   .arg(QString::fromLatin1(document), -18)
                   .arg(m, 7, 'f', 1)
                   .arg(*std::min_element(values.begin(), values.end()), 0, 'f', 1)
                   .arg(*std::max_element(values.begin(), values.end()), 0, 'f', 1)
                   .arg(m / reference, 0, 'f', 2);
    }
    return 0;
}
