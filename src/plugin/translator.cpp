#include "translator.h"

#include <QCoreApplication>

QuorvanePelkanPlugin::Translator::~Translator()
{
    QCoreApplication::removeTranslator(this);
}
