#include "mgconfitem.h"
#include "dconfwatcher.h"
#include "gvariantconversion.h"
#include "pelkanlogging.h"

extern "C" {
#include <dconf.h>
}

MGConfItem::MGConfItem(const QString &key, QObject *parent)
    : QObject(parent)
    , m_key(key)
    , m_valid(dconf_is_key(key.toUtf8().constData(), nullptr))
{
    if (!m_valid) {
        qCWarning(lcPelkanConfigLog) << "MGConfItem: invalid configuration key:" << key;
        return;
    }
    if (DConfWatcher *watcher = DConfWatcher::instance()) {
        watcher->add(this);
        m_value = read();
    }
}

MGConfItem::~MGConfItem()
{
    if (!m_valid)
        return;
    if (DConfWatcher *watcher = DConfWatcher::instance())
        watcher->remove(this);
}

QString MGConfItem::key() const
{
    return m_key;
}

bool MGConfItem::isValid() const
{
    return m_valid;
}

QVariant MGConfItem::value() const
{
    return m_value;
}

QVariant MGConfItem::value(const QVariant &defaultValue) const
{
    return m_value.isValid() ? m_value : defaultValue;
}

void MGConfItem::set(const QVariant &value)
{
    if (!m_valid) {
        qCWarning(lcPelkanConfigLog) << "MGConfItem: cannot write invalid key:" << m_key;
        return;
    }
    if (!value.isValid()) {
        unset();
        return;
    }
    GVariant *converted = Pelkan::GVariantConversion::fromQVariant(value);
    if (!converted) {
        qCWarning(lcPelkanConfigLog) << "MGConfItem: cannot store a value of type"
                                     << value.typeName() << "in" << m_key;
        return;
    }
    DConfWatcher *watcher = DConfWatcher::instance();
    GError *error = nullptr;
    // The client takes the floating reference.
    if (!watcher || !dconf_client_write_fast(watcher->client(), m_key.toUtf8().constData(),
                                             converted, &error)) {
        qCWarning(lcPelkanConfigLog) << "MGConfItem: failed to write" << m_key << ":"
                                     << (error ? error->message : "no configuration client");
        if (error)
            g_error_free(error);
        return;
    }
    refresh();
}

void MGConfItem::unset()
{
    if (!m_valid)
        return;
    DConfWatcher *watcher = DConfWatcher::instance();
    GError *error = nullptr;
    if (!watcher || !dconf_client_write_fast(watcher->client(), m_key.toUtf8().constData(),
                                             nullptr, &error)) {
        qCWarning(lcPelkanConfigLog) << "MGConfItem: failed to unset" << m_key << ":"
                                     << (error ? error->message : "no configuration client");
        if (error)
            g_error_free(error);
        return;
    }
    refresh();
}

QStringList MGConfItem::listDirs() const
{
    return list(true);
}

QStringList MGConfItem::listEntries() const
{
    return list(false);
}

void MGConfItem::sync()
{
    if (DConfWatcher *watcher = DConfWatcher::instance())
        dconf_client_sync(watcher->client());
}

void MGConfItem::refresh()
{
    const QVariant current = read();
    if (current == m_value && current.userType() == m_value.userType())
        return;
    m_value = current;
    Q_EMIT valueChanged();
}

QVariant MGConfItem::read() const
{
    DConfWatcher *watcher = DConfWatcher::instance();
    if (!watcher)
        return QVariant();
    GVariant *stored = dconf_client_read(watcher->client(), m_key.toUtf8().constData());
    const QVariant result = Pelkan::GVariantConversion::toQVariant(stored);
    if (stored)
        g_variant_unref(stored);
    return result;
}

QStringList MGConfItem::list(bool dirs) const
{
    QStringList result;
    DConfWatcher *watcher = DConfWatcher::instance();
    if (!m_valid || !watcher)
        return result;
    const QByteArray dir = m_key.toUtf8() + '/';
    int length = 0;
    gchar **names = dconf_client_list(watcher->client(), dir.constData(), &length);
    for (int i = 0; i < length; ++i) {
        QString name = QString::fromUtf8(names[i]);
        const bool isDir = name.endsWith(QLatin1Char('/'));
        if (isDir != dirs)
            continue;
        if (isDir)
            name.chop(1);
        result.append(QString::fromUtf8(dir) + name);
    }
    g_strfreev(names);
    result.sort();
    return result;
}
