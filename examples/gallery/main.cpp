// The gallery: every component of the toolkit on one page per subject.
//
//   pelkan-gallery                       opens the gallery in a window
//   pelkan-gallery --screenshot out.png  renders it once and saves a picture
//   pelkan-gallery --page orientation    opens on another page

#include "screenshotter.h"

#include <QCommandLineParser>
#include <QDir>
#include <QGuiApplication>
#include <QQmlApplicationEngine>
#include <QQuickWindow>
#include <QTranslator>

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    app.setApplicationName(QStringLiteral("pelkan-gallery"));

    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("Quorvane Pelkan component gallery"));
    parser.addHelpOption();
    const QCommandLineOption screenshot(QStringLiteral("screenshot"),
                                        QStringLiteral("Render once, save a PNG to <file> and quit."),
                                        QStringLiteral("file"));
    parser.addOption(screenshot);
    const QCommandLineOption page(QStringLiteral("page"), QStringLiteral("Open on <page>: theme, images, orientation, format, gestures, cover, text."),
                                  QStringLiteral("page"), QStringLiteral("theme"));
    parser.addOption(page);
    parser.process(app);

    QQmlApplicationEngine engine;
    // Run from a build tree, use its modules and catalogues rather than installed ones.
    const QString buildTree = QCoreApplication::applicationDirPath() + QStringLiteral("/..");
    QTranslator fallback;
    QTranslator localised;
    if (QDir(buildTree + QStringLiteral("/qml/Quorvane/Pelkan")).exists()) {
        engine.addImportPath(buildTree + QStringLiteral("/qml"));
        const QString catalogues = buildTree + QStringLiteral("/translations");
        if (fallback.load(QStringLiteral("quorvanepelkan-qt5_eng_en"), catalogues))
            QCoreApplication::installTranslator(&fallback);
        if (localised.load(QLocale(), QStringLiteral("quorvanepelkan-qt5"), QStringLiteral("-"), catalogues))
            QCoreApplication::installTranslator(&localised);
    }

    engine.setInitialProperties({ { QStringLiteral("initialPage"), parser.value(page) } });
    engine.load(QUrl(QStringLiteral("qrc:/gallery/main.qml")));
    auto window = engine.rootObjects().isEmpty() ? nullptr : qobject_cast<QQuickWindow *>(engine.rootObjects().first());
    if (!window)
        return 1;

    if (parser.isSet(screenshot))
        new Screenshotter(window, parser.value(screenshot), &app);
    return app.exec();
}
