#pragma once

#include <QElapsedTimer>
#include <QJSValue>
#include <QObject>
#include <QPersistentModelIndex>
#include <QPointer>
#include <QTimer>
#include <qqml.h>

class QAbstractItemModel;

// Attached as RemorseCache to a list view: keeps the running remorse countdowns of its rows
// ("Deleting in 5 s, tap to cancel") by model row, not by delegate, so that a countdown
// goes on while its delegate scrolls out and is destroyed, and a new delegate for the row
// shows it again. With a QAbstractItemModel the rows are followed through moves, and a row
// removed meanwhile takes only its own countdown along (its action never runs).
class RemorseCache : public QObject
{
    Q_OBJECT
    Q_PROPERTY(int count READ count NOTIFY countChanged)

public:
    explicit RemorseCache(QObject *view = nullptr);
    ~RemorseCache() override;

    static RemorseCache *qmlAttachedProperties(QObject *object);

    int count() const { return m_entries.size(); }

    // Starts (or starts again) the countdown of row; action runs when it ends.
    Q_INVOKABLE void start(int row, int timeout, const QJSValue &action, const QString &text = QString());
    Q_INVOKABLE void cancel(int row);
    Q_INVOKABLE bool running(int row) const;
    // Milliseconds left, 0 when not running.
    Q_INVOKABLE int remaining(int row) const;
    Q_INVOKABLE QString text(int row) const;

Q_SIGNALS:
    void countChanged();
    void started(int row);
    void triggered(int row);
    void canceled(int row);

private:
    struct Entry {
        QPersistentModelIndex index; // with an item model
        int row = -1;                // otherwise
        qint64 deadline = 0;
        QJSValue action;
        QString text;
    };

    QAbstractItemModel *model() const;
    int rowOf(const Entry &entry) const;
    int find(int row) const;
    void fire();
    void schedule();

    QObject *m_view;
    QVector<Entry> m_entries;
    QTimer m_timer;
    QElapsedTimer m_clock;
};

QML_DECLARE_TYPEINFO(RemorseCache, QML_HAS_ATTACHED_PROPERTIES)
