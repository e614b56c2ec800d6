// A reference home screen for running applications under a real compositor: a headless
// Wayland compositor that records what applications publish, and acts on commands.
//
//   pelkan-home-screen [--socket NAME] [-- COMMAND [ARGUMENT...]]
//
// With a command, the home screen runs it as its client, records what it logs, and ends
// when it ends. Other clients connect with WAYLAND_DISPLAY=NAME, QT_QPA_PLATFORM=wayland
// and QT_WAYLAND_SHELL_INTEGRATION=wl-shell. Records are JSON lines on standard output;
// commands are lines on standard input: "focus" (the newest application window gets the
// keyboard), "key back", "trigger <index>", "coverstatus <status>", "names" (the cover
// action names on the bus), "quit". End of input also quits.

#include "homescreen.h"

#include <QCommandLineParser>
#include <QGuiApplication>
#include <QSocketNotifier>

#include <unistd.h>

int main(int argc, char *argv[])
{
    // The home screen draws nothing itself.
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QGuiApplication app(argc, argv);
    app.setApplicationName(QStringLiteral("pelkan-home-screen"));

    QCommandLineParser parser;
    parser.addHelpOption();
    QCommandLineOption socket(QStringLiteral("socket"), QStringLiteral("Wayland socket name."), QStringLiteral("name"),
                              QStringLiteral("pelkan-home-screen-%1").arg(QCoreApplication::applicationPid()));
    parser.addOption(socket);
    parser.addPositionalArgument(QStringLiteral("command"), QStringLiteral("An application to run under the home screen."),
                                 QStringLiteral("[-- command [argument...]]"));
    parser.process(app);

    HomeScreen home(parser.value(socket).toUtf8());
    if (!home.start())
        return 1;
    QObject::connect(&home, &HomeScreen::quitRequested, &app, &QCoreApplication::quit, Qt::QueuedConnection);
    if (!parser.positionalArguments().isEmpty())
        home.launch(parser.positionalArguments());

    QSocketNotifier input(STDIN_FILENO, QSocketNotifier::Read);
    QByteArray pending;
    QObject::connect(&input, &QSocketNotifier::activated, &app, [&] {
        char buffer[512];
        const ssize_t n = ::read(STDIN_FILENO, buffer, sizeof buffer);
        if (n <= 0) {
            input.setEnabled(false);
            QCoreApplication::quit();
            return;
        }
        pending.append(buffer, int(n));
        int end;
        while ((end = pending.indexOf('\n')) >= 0) {
            home.handleCommand(QString::fromUtf8(pending.left(end)));
            pending.remove(0, end + 1);
        }
    });
    return app.exec();
}
