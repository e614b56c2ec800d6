// Blur benchmark: time per frame of a full-window blur of a live source (content that
// changes every frame), against Qt Graphical Effects' GaussianBlur and FastBlur with a
// blur of about the same width (a deviation of some 16 pixels). Each variant runs in a
// process of its own, in the basic render loop, for 200 frames after 30 to settle.

#include <QCoreApplication>
#include <QGuiApplication>
#include <QProcess>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickView>
#include <QRegularExpression>
#include <QTextStream>

#include "../common/summary.h"
#include "../common/frametiming.h"

#include <algorithm>
#include <vector>

namespace {

// The effect's import line and its element.
QPair<QByteArray, QByteArray> effect(const QString &kind)
{
    if (kind == QLatin1String("pelkan"))
        // Three levels of the 9-tap kernel from half size on: 1.8 * 2 * sqrt(1 + 4 + 16),
        // about 16 pixels.
        return { "import Quorvane.Pelkan.private 1.0\n",
                 "BlurEffect { anchors.fill: parent; sourceItem: content; kernel: BlurEffect.Gaussian9; levels: 3 }\n" };
    if (kind == QLatin1String("gaussian"))
        return { "import QtGraphicalEffects 1.0\n",
                 "GaussianBlur { anchors.fill: parent; source: content; radius: 32; samples: 65; deviation: 16 }\n" };
    return { "import QtGraphicalEffects 1.0\n", "FastBlur { anchors.fill: parent; source: content; radius: 64 }\n" };
}

int runVariant(const QString &kind)
{
    qputenv("QSG_RENDER_LOOP", "basic");
    QQuickView view;
    view.engine()->addImportPath(QStringLiteral(PELKAN_QML_DIR));
    const QPair<QByteArray, QByteArray> blur = effect(kind);
    const QByteArray document =
            blur.first + "import QtQuick 2.6\n"
            "Item { width: 540; height: 960\n"
            "  Item { id: content; anchors.fill: parent; visible: false\n"
            "    Grid { columns: 9; Repeater { model: 144; Rectangle { width: 60; height: 60\n"
            "      color: Qt.hsla((index % 12) / 12, 0.7, 0.5, 1) } } }\n"
            "    Rectangle { id: bar; width: 540; height: 40; color: 'white'\n"
            "      NumberAnimation on y { from: 0; to: 920; duration: 1000; loops: Animation.Infinite } } }\n"
            "  " + blur.second + "}\n";
    QQmlComponent component(view.engine());
    component.setData(document, QUrl());
    QScopedPointer<QObject> root(component.create());
    if (!root) {
        QTextStream(stderr) << component.errorString();
        return 1;
    }
    view.setContent(QUrl(), &component, root.take());
    view.resize(540, 960);
    return timeFrames(view, [&] {
        if (qEnvironmentVariableIsSet("PELKAN_BLUR_BENCH_GRAB"))
            view.grabWindow().save(qEnvironmentVariable("PELKAN_BLUR_BENCH_GRAB") + kind + QLatin1String(".png"));
    });
}

double frameMs(const QString &program, const QString &kind)
{
    QProcess child;
    child.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    child.start(program, { QStringLiteral("--variant"), kind });
    child.waitForFinished(120000);
    const QString output = QString::fromUtf8(child.readAllStandardOutput());
    return QRegularExpression(QStringLiteral("frame-ms ([0-9.]+)")).match(output).captured(1).toDouble();
}

double median(std::vector<double> v)
{
    std::sort(v.begin(), v.end());
    return v[v.size() / 2];
}

} // namespace

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    const QStringList args = app.arguments();
    if (args.size() > 2 && args.at(1) == QLatin1String("--variant"))
        return runVariant(args.at(2));

    std::vector<double> ours, gaussian, fast;
    for (int round = 0; round < 3; ++round) {
        ours.push_back(frameMs(app.applicationFilePath(), QStringLiteral("pelkan")));
        gaussian.push_back(frameMs(app.applicationFilePath(), QStringLiteral("gaussian")));
        fast.push_back(frameMs(app.applicationFilePath(), QStringLiteral("fast")));
    }
    QTextStream(stdout) << QStringLiteral("Full-window blur of a live 540x960 source, ms per frame (median of 3 runs):\n"
                                          "  BlurEffect   %1\n  GaussianBlur %2\n  FastBlur     %3\n"
                                          "  ratios: against GaussianBlur %4x, against FastBlur %5x\n")
                                   .arg(median(ours), 0, 'f', 2).arg(median(gaussian), 0, 'f', 2).arg(median(fast), 0, 'f', 2)
                                   .arg(median(ours) / median(gaussian), 0, 'f', 2).arg(median(ours) / median(fast), 0, 'f', 2);
    Summary::row(QStringLiteral("full-window live blur vs GaussianBlur"), Summary::ms(median(ours)),
                 Summary::ms(median(gaussian)), median(ours) / median(gaussian));
    Summary::row(QStringLiteral("full-window live blur vs FastBlur"), Summary::ms(median(ours)),
                 Summary::ms(median(fast)), median(ours) / median(fast));
    return 0;
}
