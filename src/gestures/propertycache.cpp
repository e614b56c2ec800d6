#include "propertycache.h"

#include <QByteArray>
#include <QHash>
#include <QMetaProperty>
#include <QObject>

namespace {

// Keyed by class name rather than meta-object: QML gives every instance a meta-object of
// its own, but all instances of a type share the class name.
QHash<QByteArray, int> &indices()
{
    static QHash<QByteArray, int> cache;
    return cache;
}

int indexOf(const QObject *object, const char *name)
{
    const QMetaObject *meta = object->metaObject();
    const QByteArray key = QByteArray(meta->className()) + '\0' + name;
    const auto found = indices().constFind(key);
    if (found != indices().constEnd())
        return *found;
    const int index = meta->indexOfProperty(name);
    indices().insert(key, index);
    return index;
}

} // namespace

namespace PropertyCache {

QVariant read(const QObject *object, const char *name)
{
    if (!object)
        return QVariant();
    const int index = indexOf(object, name);
    return index < 0 ? QVariant() : object->metaObject()->property(index).read(object);
}

bool write(QObject *object, const char *name, const QVariant &value)
{
    if (!object)
        return false;
    const int index = indexOf(object, name);
    return index >= 0 && object->metaObject()->property(index).write(object, value);
}

} // namespace PropertyCache
