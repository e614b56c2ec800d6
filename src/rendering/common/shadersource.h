#pragma once

#include <QByteArray>
#include <QFile>
#include <QLatin1String>

// The text of a shader file in the library's resource, for programs that fill in parts
// of it before compiling.
inline QByteArray readShaderSource(const char *name)
{
    QFile file(QLatin1String(":/quorvane/pelkan/shaders/") + QLatin1String(name));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}
