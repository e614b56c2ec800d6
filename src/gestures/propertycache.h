#pragma once

#include <QVariant>

class QObject;

// Reads and writes QML properties by name, with each (type, name) index looked up once
// for the life of the process. Objects of the same QML type share one entry; a missing
// property reads as an invalid QVariant. Names must be string literals (their address is
// part of the key). GUI thread only.
namespace PropertyCache {

QVariant read(const QObject *object, const char *name);
bool write(QObject *object, const char *name, const QVariant &value);

inline bool readBool(const QObject *object, const char *name) { return object && read(object, name).toBool(); }
inline qreal readReal(const QObject *object, const char *name) { return object ? read(object, name).toReal() : 0.0; }
inline QObject *readObject(const QObject *object, const char *name)
{
    return object ? read(object, name).value<QObject *>() : nullptr;
}

} // namespace PropertyCache
