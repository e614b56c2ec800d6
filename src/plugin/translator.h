#pragma once

#include "plugin/quorvanepelkanplugin.h"

#include <QTranslator>

// A translator that uninstalls itself from the application when it is destroyed, so that
// the catalogues an engine installed go away with the engine.
class QuorvanePelkanPlugin::Translator : public QTranslator
{
    Q_OBJECT

public:
    using QTranslator::QTranslator;
    ~Translator() override;
};
