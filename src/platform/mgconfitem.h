#pragma once

#include <QObject>
#include <QStringList>
#include <QVariant>

// One device configuration key, read, written and watched through dconf.
//
// Keys are dconf paths ("/desktop/quorvane/pelkan/theme/primary_color"). value() is the
// key's current value, or an invalid QVariant while the key is unset; valueChanged()
// fires whenever the value changes, whether through set()/unset() on any item or from
// another process (a `dconf write` in a shell reaches a running application).
//
// Booleans, integers, doubles, strings and string lists map to the matching dconf
// types; other lists and string-keyed maps are stored as arrays of variants and
// dictionaries. An invalid key leaves the item inert with a warning.
class MGConfItem : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString key READ key CONSTANT)
    Q_PROPERTY(QVariant value READ value WRITE set RESET unset NOTIFY valueChanged)

public:
    explicit MGConfItem(const QString &key, QObject *parent = nullptr);
    ~MGConfItem() override;

    QString key() const;
    bool isValid() const;

    QVariant value() const;
    QVariant value(const QVariant &defaultValue) const;

    void set(const QVariant &value);
    void unset();

    // Full paths of the directories and keys directly below this key, read as a directory.
    QStringList listDirs() const;
    QStringList listEntries() const;

    // Blocks until every write made by this process has reached the configuration store.
    static void sync();

Q_SIGNALS:
    void valueChanged();

private:
    friend class DConfWatcher;
    void refresh();
    QVariant read() const;
    QStringList list(bool dirs) const;

    QString m_key;
    QVariant m_value;
    bool m_valid;
};
