#include "propertycache.h"

#include <QPair>
#include <QHash>
#include <QMetaProperty>
#include <QObject>

namespace {

// Keyed by the class name's storage rather than the meta-object: QML gives every instance
// a meta-object of its own, but all instances of a type share the class name string. The
// property names are literals, so their addresses are stable too: a lookup is two pointer
// hashes, with no string built per read (these reads run for every mouse move).
using Key = QPair<const char *, const char *>;

struct Entry {
    int index = -1;
    // Enumerations are read as plain integers: QMetaProperty::read() would look the
    // enumeration's type up by name on every read.
    bool isEnum = false;
};

QHash<Key, Entry> &entries()
{
    static QHash<Key, Entry> cache;
    return cache;
}

Entry entryOf(const QObject *object, const char *name)
{
    const QMetaObject *meta = object->metaObject();
    const Key key(meta->className(), name);
    const auto found = entries().constFind(key);
    if (found != entries().constEnd())
        return *found;
    Entry entry;
    entry.index = meta->indexOfProperty(name);
    entry.isEnum = entry.index >= 0 && meta->property(entry.index).isEnumType();
    entries().insert(key, entry);
    return entry;
}

} // namespace

namespace PropertyCache {

QVariant read(const QObject *object, const char *name)
{
    if (!object)
        return QVariant();
    const Entry entry = entryOf(object, name);
    if (entry.index < 0)
        return QVariant();
    if (entry.isEnum) {
        int value = 0;
        int status = -1;
        void *argv[] = { &value, nullptr, &status };
        QMetaObject::metacall(const_cast<QObject *>(object), QMetaObject::ReadProperty, entry.index, argv);
        return value;
    }
    return object->metaObject()->property(entry.index).read(object);
}

bool write(QObject *object, const char *name, const QVariant &value)
{
    if (!object)
        return false;
    const Entry entry = entryOf(object, name);
    return entry.index >= 0 && object->metaObject()->property(entry.index).write(object, value);
}

} // namespace PropertyCache
