#pragma once

#include <QPluginLoader>
#include <QQmlExtensionInterface>
#include <QtTest>

// The plugin binary of the build tree, loaded the way the QML engine loads it.
inline QQmlExtensionInterface *loadPelkanPlugin()
{
    static QPluginLoader loader(QString::fromLocal8Bit(qgetenv("PELKAN_TEST_PLUGIN")));
    auto plugin = qobject_cast<QQmlExtensionInterface *>(loader.instance());
    if (!plugin)
        qWarning() << "cannot load the plugin:" << loader.errorString();
    return plugin;
}
