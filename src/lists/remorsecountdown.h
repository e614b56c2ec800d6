#pragma once

#include <QElapsedTimer>
#include <QJSValue>
#include <QObject>
#include <QPersistentModelIndex>

class RemorseCache;

// One running remorse countdown of a list row ("Deleting in 5 s, tap to cancel"), made and
// kept by the view's RemorseCache. It follows its row while rows are inserted, removed and
// moved (through a persistent model index where the view's model is an item model), keeps
// its deadline, and ends exactly once: with triggered() after its action has run, or with
// canceled() when it was cancelled or its row left the model. It is deleted after it ends.
class RemorseCountdown : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString text READ text CONSTANT)
    Q_PROPERTY(int row READ row NOTIFY rowChanged)

public:
    QString text() const { return m_text; }
    // The row it counts down for now; -1 once it has ended.
    int row() const { return m_row; }

    // Milliseconds left, 0 once it has ended.
    Q_INVOKABLE int remaining() const;
    Q_INVOKABLE void cancel();

Q_SIGNALS:
    void rowChanged();
    void triggered();
    void canceled();

private:
    friend class RemorseCache;
    RemorseCountdown(RemorseCache *cache, int row, const QPersistentModelIndex &index, int timeout,
                     const QJSValue &action, const QString &text);

    // Where the row is now; false when it has left the model.
    bool follow();

    RemorseCache *m_cache;
    QPersistentModelIndex m_index; // with an item model; otherwise the row stays as given
    bool m_tracked;
    int m_row;
    int m_timeout;
    QElapsedTimer m_clock;
    QJSValue m_action;
    QString m_text;
    bool m_ended = false;
};
