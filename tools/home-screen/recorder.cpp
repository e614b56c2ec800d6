#include "recorder.h"

#include <QJsonDocument>

#include <cstdio>

Recorder::Recorder()
{
    m_out.open(stdout, QIODevice::WriteOnly | QIODevice::Unbuffered);
}

void Recorder::record(const QString &event, QJsonObject fields)
{
    fields.insert(QStringLiteral("event"), event);
    m_out.write(QJsonDocument(fields).toJson(QJsonDocument::Compact) + '\n');
    m_out.flush();
}
