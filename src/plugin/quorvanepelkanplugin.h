#pragma once

#include <QQmlExtensionPlugin>

// The entry point the QML engine loads for "Quorvane.Pelkan", "Quorvane.Pelkan.private"
// and "Quorvane.Pelkan.theme". All three module folders name this one binary.
class QuorvanePelkanPlugin : public QQmlExtensionPlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID QQmlExtensionInterface_iid)

public:
    class Translator;

    void registerTypes(const char *uri) override;
    void initializeEngine(QQmlEngine *engine, const char *uri) override;
};
