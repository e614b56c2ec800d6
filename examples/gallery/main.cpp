// The gallery: an application built from the toolkit's components, one page per subject.
//
//   pelkan-gallery                       opens the gallery in a window
//   pelkan-gallery --screenshot out.png  renders it once and saves a picture
//   pelkan-gallery --page orientation    opens on a subject over the home page

#include "photos.h"
#include "screenshotter.h"

#include <QCommandLineParser>
#include <QDir>
#include <QGuiApplication>
#include <QQmlApplicationEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTranslator>

int main(int argc, char *argv[])
{
    // The cover window is drawn over the home screen: windows need an alpha channel.
    QQuickWindow::setDefaultAlphaBuffer(true);
    QGuiApplication app(argc, argv);
    app.setApplicationName(QStringLiteral("pelkan-gallery"));

    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("Quorvane Pelkan component gallery"));
    parser.addHelpOption();
    const QCommandLineOption screenshot(QStringLiteral("screenshot"),
                                        QStringLiteral("Render once, save a PNG to <file> and quit."),
                                        QStringLiteral("file"));
    parser.addOption(screenshot);
    const QCommandLineOption page(QStringLiteral("page"),
                                  QStringLiteral("Open on <page>: home, theme, images, orientation, format, gestures, cover, form, dialog, lists, search, photos, tabs, backgrounds."),
                                  QStringLiteral("page"), QStringLiteral("home"));
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

    engine.setInitialProperties({ { QStringLiteral("startPage"), parser.value(page) },
                                  { QStringLiteral("photos"), samplePhotos() } });
    engine.load(QUrl(QStringLiteral("qrc:/gallery/main.qml")));
    // The application window makes the window it lives in.
    auto root = engine.rootObjects().isEmpty() ? nullptr : qobject_cast<QQuickItem *>(engine.rootObjects().first());
    for (int turn = 0; root && !root->window() && turn < 10; ++turn)
        QCoreApplication::processEvents(); // it makes its window once loading is over
    QQuickWindow *window = root ? root->window() : nullptr;
    if (!window)
        return 1;

    if (parser.isSet(screenshot))
        new Screenshotter(window, parser.value(screenshot), &app);
    return app.exec();
}
