// Transient images benchmark: resident memory of a window showing eight 1500x1500 photos,
// loaded through the "transientimage" provider and, as the peer, as plain file Images,
// each with and without QSG_TRANSIENT_IMAGES. Every variant runs in a process of its own
// and reports its resident set once all images are on screen.

#include "rendering/providers/transientimageprovider.h"

#include "../common/summary.h"

#include <QDir>
#include <QFile>
#include <QGuiApplication>
#include <QImage>
#include <QPainter>
#include <QProcess>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickView>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <QTextStream>
#include <QTimer>

namespace {

const int Count = 8;

double residentMegabytes()
{
    QFile status(QStringLiteral("/proc/self/status"));
    if (!status.open(QIODevice::ReadOnly))
        return 0;
    const QRegularExpressionMatch match
            = QRegularExpression(QStringLiteral("VmRSS:\\s+(\\d+) kB")).match(QString::fromLatin1(status.readAll()));
    return match.captured(1).toDouble() / 1024;
}

int runVariant(const QString &kind, const QString &folder)
{
    qputenv("QSG_RENDER_LOOP", "basic");
    QQuickView view;
    view.engine()->addImageProvider(QStringLiteral("transientimage"), new TransientImageProvider);
    const QByteArray scheme = kind == QLatin1String("provider") ? "image://transientimage/" : "file://";
    QQmlComponent component(view.engine());
    component.setData("import QtQuick 2.6\n"
                      "Grid { columns: 4; width: 400; height: 200; property int ready: 0\n"
                      "  Repeater { model: " + QByteArray::number(Count) + "\n"
                      "    Image { width: 100; height: 100; asynchronous: true\n"
                      "      source: '" + scheme + folder.toUtf8() + "/photo' + index + '.png'\n"
                      "      onStatusChanged: if (status === Image.Ready) parent.ready++ } } }\n", QUrl());
    QScopedPointer<QObject> root(component.create());
    if (!root) {
        QTextStream(stderr) << component.errorString();
        return 1;
    }
    QObject *grid = root.take();
    view.setContent(QUrl(), &component, grid);
    int settled = 0;
    QObject::connect(&view, &QQuickWindow::frameSwapped, [&] {
        // A few frames after the last image arrived, its texture exists.
        if (grid->property("ready").toInt() == Count && ++settled == 5) {
            QTextStream(stdout) << "rss-mb " << residentMegabytes() << Qt::endl;
            QCoreApplication::exit(0);
        }
        view.update();
    });
    view.show();
    return QGuiApplication::exec();
}

double measure(const QString &program, const QString &kind, const QString &folder, bool transient)
{
    QProcess child;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    if (transient)
        environment.insert(QStringLiteral("QSG_TRANSIENT_IMAGES"), QStringLiteral("1"));
    child.setProcessEnvironment(environment);
    child.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    child.start(program, { QStringLiteral("--variant"), kind, folder });
    child.waitForFinished(120000);
    return QRegularExpression(QStringLiteral("rss-mb ([0-9.]+)"))
            .match(QString::fromUtf8(child.readAllStandardOutput())).captured(1).toDouble();
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    const QStringList args = app.arguments();
    if (args.size() > 3 && args.at(1) == QLatin1String("--variant"))
        return runVariant(args.at(2), args.at(3));

    QTemporaryDir folder;
    for (int i = 0; i < Count; ++i) {
        QImage photo(1500, 1500, QImage::Format_RGB32);
        photo.fill(QColor::fromHsv(i * 40, 200, 200));
        QPainter(&photo).drawEllipse(100, 100, 1300, 1300);
        photo.save(folder.filePath(QStringLiteral("photo%1.png").arg(i)));
    }
    const QString self = app.applicationFilePath();
    const double provider = measure(self, QStringLiteral("provider"), folder.path(), false);
    const double providerTransient = measure(self, QStringLiteral("provider"), folder.path(), true);
    const double plain = measure(self, QStringLiteral("plain"), folder.path(), false);
    const double plainTransient = measure(self, QStringLiteral("plain"), folder.path(), true);
    QTextStream(stdout) << QStringLiteral("Resident memory with %1 photos of 1500x1500 on screen, MB:\n"
                                          "  transientimage provider  %2, with QSG_TRANSIENT_IMAGES %3 (%4 MB less)\n"
                                          "  plain file Image         %5, with QSG_TRANSIENT_IMAGES %6\n"
                                          "  ratios against plain Image: %7x kept, %8x transient\n")
                                   .arg(Count).arg(provider, 0, 'f', 0).arg(providerTransient, 0, 'f', 0)
                                   .arg(provider - providerTransient, 0, 'f', 0).arg(plain, 0, 'f', 0)
                                   .arg(plainTransient, 0, 'f', 0).arg(provider / plain, 0, 'f', 2)
                                   .arg(providerTransient / plainTransient, 0, 'f', 2);
    Summary::row(QStringLiteral("8 large photos, transientimage provider vs file Image"), Summary::mb(provider),
                 Summary::mb(plain), provider / plain);
    Summary::row(QStringLiteral("8 large photos, the same with QSG_TRANSIENT_IMAGES"), Summary::mb(providerTransient),
                 Summary::mb(plainTransient), providerTransient / plainTransient);
    return 0;
}
