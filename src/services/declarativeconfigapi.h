#pragma once

#include <QHash>
#include <QObject>
#include <QVariant>

class MGConfItem;
class QQmlEngine;

// Config: device configuration keys for QML.
//     Config.value("/desktop/app/columns", 2)   the key's value, or the default while unset
//     Config.setValue(key, value), Config.unset(key)
// A binding that reads a key follows it: a change from anywhere (a `dconf write` in a
// shell included) re-evaluates the binding at once. A stored value that does not fit the
// default's type reads as the default, with one warning naming the key.
class DeclarativeConfigApi : public QObject
{
    Q_OBJECT

public:
    explicit DeclarativeConfigApi(QQmlEngine *engine, QObject *parent = nullptr);
    ~DeclarativeConfigApi() override;

    Q_INVOKABLE QVariant value(const QString &key, const QVariant &defaultValue = QVariant());
    Q_INVOKABLE void setValue(const QString &key, const QVariant &value);
    Q_INVOKABLE void unset(const QString &key);
    // Blocks until this process's writes have reached the store.
    Q_INVOKABLE void sync();

Q_SIGNALS:
    void valueChanged(const QString &key);

private:
    struct Entry;
    Entry *entry(const QString &key);

    QQmlEngine *m_engine;
    QHash<QString, Entry *> m_entries;
};
