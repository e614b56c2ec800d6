// Theme images against Qt's own ways of showing the same icons.
//
// 1. Decoding: theme icons decoded, tinted and bordered per second by the "theme" provider
//    against an image provider that reads the same files untinted.
// 2. Drawing: a page of 200 tinted icons, render batches per frame and time per frame,
//    against the same page of Image elements each tinted by a ColorOverlay.
//
//   pelkan-images-bench                 runs both, printing ratios
//   pelkan-images-bench --page KIND     one page run (theme or overlay), used by the above

#include "rendering/themeimages/declarativeimageprovider.h"
#include "theme.h"
#include "themeiconresolver.h"

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QImageReader>
#include <QProcess>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickImageProvider>
#include <QQuickView>
#include <QRegularExpression>
#include <QTextStream>
#include <QTimer>

#include "../common/summary.h"
#include "../common/frametiming.h"

#include <algorithm>
#include <vector>

namespace {

const char *const Icons[] = { "icon-m-back", "icon-m-forward", "icon-m-add", "icon-m-close",
                              "icon-m-search", "icon-m-menu", "icon-m-home", "icon-m-favorite" };

// Qt's plain path: read the file at the requested size, no tint.
class PlainProvider : public QQuickImageProvider
{
public:
    PlainProvider() : QQuickImageProvider(Image) {}
    QImage requestImage(const QString &id, QSize *size, const QSize &requested) override
    {
        QImageReader reader(m_resolver.resolvePath(id));
        if (requested.isValid())
            reader.setScaledSize(requested);
        const QImage image = reader.read();
        if (size)
            *size = image.size();
        return image;
    }

private:
    Pelkan::ThemeIconResolver m_resolver;
};

template <typename Body>
double perSecond(Body body)
{
    QElapsedTimer timer;
    timer.start();
    qint64 count = 0;
    while (timer.elapsed() < 300) {
        for (const char *icon : Icons)
            body(QString::fromLatin1(icon));
        count += 8;
    }
    return count / (timer.nsecsElapsed() / 1e9);
}

double median(std::vector<double> v)
{
    std::sort(v.begin(), v.end());
    return v[v.size() / 2];
}

int runPage(const QString &kind)
{
    qputenv("QSG_RENDER_LOOP", "basic");
    QQuickView view;
    view.engine()->addImportPath(QStringLiteral(PELKAN_QML_DIR));
    const bool theme = kind == QLatin1String("theme");
    const QByteArray icon = theme
            ? "Image { width: 32; height: 32; source: 'image://theme/' + icons[index % 8] + '?#ff8800' }"
            : "Item { width: 32; height: 32\n"
              "  Image { id: i; anchors.fill: parent; sourceSize: Qt.size(32, 32); visible: false; source: 'file://' + dir + '/icons/' + icons[index % 8] + '.svg' }\n"
              "  ColorOverlay { anchors.fill: i; source: i; color: '#ff8800' } }";
    const QByteArray document = "import QtQuick 2.6\n" + QByteArray(theme ? "import Quorvane.Pelkan 1.0\n" : "import QtGraphicalEffects 1.0\n")
            + "Grid { columns: 16; spacing: 2; width: 540; height: 960\n"
              "  property var icons: ['icon-m-back','icon-m-forward','icon-m-add','icon-m-close','icon-m-search','icon-m-menu','icon-m-home','icon-m-favorite']\n"
              "  property string dir: '" + Pelkan::Theme::defaultThemeDirectory().toUtf8() + "'\n"
              "  property real spin: 0\n"
              "  NumberAnimation on spin { from: 0; to: 1; duration: 1000; loops: Animation.Infinite }\n"
              "  Repeater { model: 200\n  " + icon + " } }\n";
    QQmlComponent component(view.engine());
    component.setData(document, QUrl());
    QScopedPointer<QObject> root(component.create());
    if (!root) {
        QTextStream(stderr) << component.errorString();
        return 1;
    }
    view.setContent(QUrl(), &component, root.data());
    view.resize(540, 960);
    root.take();
    return timeFrames(view);
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    const QStringList args = app.arguments();
    if (args.size() > 2 && args.at(1) == QLatin1String("--page"))
        return runPage(args.at(2));

    QTextStream out(stdout);
    // 1. Decoding.
    DeclarativeImageProvider theme;
    PlainProvider plain;
    std::vector<double> ours, qts;
    for (int round = 0; round < 7; ++round) {
        ours.push_back(perSecond([&](const QString &name) {
            QSize size;
            delete theme.requestTexture(name + QLatin1String("?#ff8800"), &size, QSize(64, 64));
        }));
        qts.push_back(perSecond([&](const QString &name) {
            QSize size;
            plain.requestImage(name, &size, QSize(64, 64));
        }));
    }
    out << QStringLiteral("Icons decoded per second (64x64, median of 7 rounds):\n"
                          "  theme provider, tinted and bordered %1\n  plain provider, untinted %2\n  ratio %3x\n")
                   .arg(median(ours), 0, 'f', 0).arg(median(qts), 0, 'f', 0).arg(median(ours) / median(qts), 0, 'f', 2);

    Summary::row(QStringLiteral("theme icons decoded, tinted+bordered vs plain provider untinted"),
                 Summary::count(median(ours), "/s"), Summary::count(median(qts), "/s"), median(ours) / median(qts),
                 Summary::AtLeast, 1.0);

    // 2. Drawing, each page in a process of its own with the renderer's batch report.
    auto page = [&](const QString &kind, double *frameMs, int *batches) {
        QProcess child;
        QProcessEnvironment env = QProcessEnvironment::systemEnvironment();
        env.insert(QStringLiteral("QSG_RENDERER_DEBUG"), QStringLiteral("render"));
        child.setProcessEnvironment(env);
        child.start(app.applicationFilePath(), { QStringLiteral("--page"), kind });
        child.waitForFinished(60000);
        const QString output = QString::fromUtf8(child.readAllStandardOutput());
        const QString log = QString::fromUtf8(child.readAllStandardError());
        *frameMs = QRegularExpression(QStringLiteral("frame-ms ([0-9.]+)")).match(output).captured(1).toDouble();
        // The last frame's report: "... N nodes in M batches" for the opaque and alpha passes.
        QRegularExpressionMatchIterator it = QRegularExpression(QStringLiteral("in (\\d+) batches")).globalMatch(log);
        QList<int> counts;
        while (it.hasNext())
            counts << it.next().captured(1).toInt();
        *batches = counts.size() >= 2 ? counts.at(counts.size() - 1) + counts.at(counts.size() - 2) : -1;
    };
    double themeMs = 0, overlayMs = 0;
    int themeBatches = 0, overlayBatches = 0;
    page(QStringLiteral("theme"), &themeMs, &themeBatches);
    page(QStringLiteral("overlay"), &overlayMs, &overlayBatches);
    out << QStringLiteral("Page of 200 tinted icons:\n"
                          "  theme images       %1 batches, %2 ms per frame\n"
                          "  Image+ColorOverlay %3 batches, %4 ms per frame\n"
                          "  ratios: batches %5x, frame time %6x\n")
                   .arg(themeBatches).arg(themeMs, 0, 'f', 2).arg(overlayBatches).arg(overlayMs, 0, 'f', 2)
                   .arg(double(themeBatches) / qMax(1, overlayBatches), 0, 'f', 3).arg(themeMs / overlayMs, 0, 'f', 2);
    Summary::row(QStringLiteral("page of 200 tinted icons, frame time vs Image+ColorOverlay"), Summary::ms(themeMs),
                 Summary::ms(overlayMs), themeMs / overlayMs);
    return 0;
}
