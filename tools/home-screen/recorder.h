#pragma once

#include <QFile>
#include <QJsonObject>

// Writes what the home screen sees as one JSON object per line on standard output, so
// that a test (or a person) can follow along.
class Recorder
{
public:
    Recorder();
    void record(const QString &event, QJsonObject fields = {});

private:
    QFile m_out;
};
