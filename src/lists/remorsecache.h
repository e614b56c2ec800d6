#pragma once

#include <QObject>
#include <QPointer>
#include <QTimer>
#include <QVector>
#include <qqml.h>

class QAbstractItemModel;
class RemorseCountdown;

// Attached as RemorseCache to a list view: keeps the running remorse countdowns of its rows
// ("Deleting in 5 s, tap to cancel") by model row, not by delegate, so that a countdown goes
// on while its delegate scrolls out and is destroyed, and a new delegate for the row shows it
// again.
//
// Where the view's model is an item model (a ListModel is one), each countdown follows its row
// through inserts, removes and moves. A countdown whose row leaves the model (removed, filtered
// out, the model reset or replaced) ends with canceled() and a warning; its action never runs.
// When the model itself is destroyed (its page popped), countdowns end with canceled() quietly.
// Other models (a number, a script array) say nothing of their rows: a countdown keeps the row
// it was started on, and all end that way when the view's model changes.
class RemorseCache : public QObject
{
    Q_OBJECT
    Q_PROPERTY(int count READ count NOTIFY countChanged)

public:
    // Left: its row left the model (a warning says so); Dropped: the model itself went,
    // as when the page holding it is popped (no warning: nothing was lost).
    enum Ending { Triggered, Canceled, Left, Dropped };

    explicit RemorseCache(QObject *view = nullptr);
    ~RemorseCache() override;

    static RemorseCache *qmlAttachedProperties(QObject *object);

    int count() const { return m_countdowns.size(); }

    // Starts the countdown of row (a running one there is cancelled first); action runs when
    // it ends. Returns the countdown (a RemorseCountdown), or null for a row below 0.
    Q_INVOKABLE QObject *start(int row, int timeout, const QJSValue &action, const QString &text = QString());
    // The countdown running for row, or null.
    Q_INVOKABLE QObject *at(int row) const;
    Q_INVOKABLE void cancel(int row);
    Q_INVOKABLE bool running(int row) const { return find(row) != nullptr; }

Q_SIGNALS:
    void countChanged();
    void started(int row);
    void triggered(int row);
    void canceled(int row);

private:
    friend class RemorseCountdown;

    RemorseCountdown *find(int row) const;
    void end(RemorseCountdown *countdown, Ending ending);
    void fire();
    void schedule();
    void watchModel();
    void followRows();
    void endAll(Ending ending);

private Q_SLOTS:
    void modelReplaced();

private:

    QObject *m_view;
    QPointer<QAbstractItemModel> m_model;
    bool m_watchingView = false;
    QVector<RemorseCountdown *> m_countdowns;
    QTimer m_timer;
};

QML_DECLARE_TYPEINFO(RemorseCache, QML_HAS_ATTACHED_PROPERTIES)
