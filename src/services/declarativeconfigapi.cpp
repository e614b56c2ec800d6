#include "declarativeconfigapi.h"

#include "platform/mgconfitem.h"
#include "core/pelkanlogging.h"

#include <QJSValue>
#include <QQmlEngine>
#include <private/qqmlengine_p.h>
#include <private/qqmljavascriptexpression_p.h>
#include <private/qqmlnotifier_p.h>

// A watched key and what waits on it: the bindings that read it.
struct DeclarativeConfigApi::Entry {
    MGConfItem *item = nullptr;
    QQmlNotifier readers;
    bool warned = false;
};

DeclarativeConfigApi::DeclarativeConfigApi(QQmlEngine *engine, QObject *parent)
    : QObject(parent)
    , m_engine(engine)
{
}

DeclarativeConfigApi::~DeclarativeConfigApi()
{
    qDeleteAll(m_entries);
}

DeclarativeConfigApi::Entry *DeclarativeConfigApi::entry(const QString &key)
{
    Entry *&entry = m_entries[key];
    if (!entry) {
        entry = new Entry;
        entry->item = new MGConfItem(key, this);
        Entry *watched = entry;
        connect(entry->item, &MGConfItem::valueChanged, this, [this, watched, key] {
            watched->warned = false;
            watched->readers.notify();
            Q_EMIT valueChanged(key);
        });
    }
    return entry;
}

QVariant DeclarativeConfigApi::value(const QString &key, const QVariant &defaultValue)
{
    Entry *watched = entry(key);
    // The binding calling this depends on the key from now on.
    if (m_engine) {
        if (QQmlPropertyCapture *capture = QQmlEnginePrivate::get(m_engine)->propertyCapture)
            capture->captureProperty(&watched->readers);
    }
    if (!watched->item->isValid())
        return defaultValue;
    const QVariant stored = watched->item->value();
    if (!stored.isValid() || !defaultValue.isValid())
        return stored.isValid() ? stored : defaultValue;

    // Numbers of either kind are numbers; otherwise the stored type must be the default's.
    const auto isNumber = [](const QVariant &v) {
        return v.type() == QVariant::Int || v.type() == QVariant::Double || v.type() == QVariant::LongLong
                || v.type() == QVariant::UInt || v.type() == QVariant::ULongLong;
    };
    const bool fits = stored.userType() == defaultValue.userType()
            || (isNumber(stored) && isNumber(defaultValue))
            || (stored.type() == QVariant::StringList && defaultValue.type() == QVariant::List);
    if (fits)
        return stored;
    if (!watched->warned) {
        qCWarning(lcPelkanServicesLog) << "Config: the value of" << key << "is a" << stored.typeName()
                                       << "where a" << defaultValue.typeName() << "was expected; using the default";
        watched->warned = true;
    }
    return defaultValue;
}

void DeclarativeConfigApi::setValue(const QString &key, const QVariant &value)
{
    // Script arrays and objects arrive wrapped.
    entry(key)->item->set(value.userType() == qMetaTypeId<QJSValue>() ? value.value<QJSValue>().toVariant() : value);
}

void DeclarativeConfigApi::unset(const QString &key)
{
    entry(key)->item->unset();
}

void DeclarativeConfigApi::sync()
{
    MGConfItem::sync();
}
