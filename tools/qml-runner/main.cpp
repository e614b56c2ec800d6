// Runs one QML file as an application would: pelkan-qml-runner FILE [name=value ...], with
// the modules of the build tree it was built in when it runs from there, the installed
// ones otherwise.
// Each name=value sets a property of the root object before it completes ("true" and
// "false" are booleans, whole numbers are integers, anything else is text) and keeps it
// there: deviceOrientation=2 turns the device for as long as the runner runs.

#include "propertypin.h"

#include <QDir>
#include <QGuiApplication>
#include <QQmlApplicationEngine>
#include <QQuickWindow>
#include <QUrl>

#include <cstdio>

static QVariant parseValue(const QString &text)
{
    if (text == QLatin1String("true") || text == QLatin1String("false"))
        return text == QLatin1String("true");
    bool ok = false;
    const int number = text.toInt(&ok);
    return ok ? QVariant(number) : QVariant(text);
}

int main(int argc, char *argv[])
{
    QQuickWindow::setDefaultAlphaBuffer(true);
    QGuiApplication app(argc, argv);
    const QStringList arguments = app.arguments();
    if (arguments.size() < 2) {
        std::fprintf(stderr, "usage: %s FILE [name=value ...]\n", argv[0]);
        return 2;
    }

    QVariantMap properties;
    for (const QString &argument : arguments.mid(2)) {
        const int equals = argument.indexOf(QLatin1Char('='));
        if (equals > 0)
            properties.insert(argument.left(equals), parseValue(argument.mid(equals + 1)));
    }

    QQmlApplicationEngine engine;
    if (QDir(QCoreApplication::applicationDirPath()) == QDir(QStringLiteral(PELKAN_BUILD_BIN_DIR)))
        engine.addImportPath(QStringLiteral(PELKAN_QML_DIR));
    engine.setInitialProperties(properties);
    engine.load(QUrl::fromLocalFile(arguments.at(1)));
    if (engine.rootObjects().isEmpty())
        return 1;
    for (QObject *root : engine.rootObjects()) {
        for (auto it = properties.cbegin(); it != properties.cend(); ++it) {
            const int index = root->metaObject()->indexOfProperty(it.key().toUtf8().constData());
            if (index >= 0)
                new PropertyPin(root, root->metaObject()->property(index), it.value());
        }
    }
    return app.exec();
}
