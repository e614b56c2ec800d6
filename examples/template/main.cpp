#include <QGuiApplication>
#include <QQmlApplicationEngine>
#include <QQuickWindow>

#include <quorvane-pelkan/theme.h>

int main(int argc, char *argv[])
{
    // The cover is drawn over the home screen: windows need an alpha channel.
    QQuickWindow::setDefaultAlphaBuffer(true);
    QGuiApplication app(argc, argv);
    app.setApplicationName(QStringLiteral("my-application"));

    QQmlApplicationEngine engine;
    engine.load(QUrl(QStringLiteral("qrc:/main.qml")));
    if (engine.rootObjects().isEmpty())
        return 1;
    // The theme is there for C++ too, following the device configuration.
    qInfo("application: highlight colour %s", qPrintable(Pelkan::Theme::instance()->highlightColor().name()));
    return app.exec();
}
