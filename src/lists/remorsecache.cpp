#include "remorsecache.h"

#include <QAbstractItemModel>
#include <QPointer>

RemorseCache::RemorseCache(QObject *view)
    : QObject(view)
    , m_view(view)
{
    m_timer.setSingleShot(true);
    connect(&m_timer, &QTimer::timeout, this, &RemorseCache::fire);
    m_clock.start();
}

RemorseCache::~RemorseCache() = default;

RemorseCache *RemorseCache::qmlAttachedProperties(QObject *object)
{
    return new RemorseCache(object);
}

QAbstractItemModel *RemorseCache::model() const
{
    return m_view ? qobject_cast<QAbstractItemModel *>(m_view->property("model").value<QObject *>()) : nullptr;
}

int RemorseCache::rowOf(const Entry &entry) const
{
    if (entry.row >= 0)
        return entry.row;
    return entry.index.isValid() ? entry.index.row() : -1;
}

int RemorseCache::find(int row) const
{
    for (int i = 0; i < m_entries.size(); ++i) {
        if (rowOf(m_entries.at(i)) == row)
            return i;
    }
    return -1;
}

void RemorseCache::start(int row, int timeout, const QJSValue &action, const QString &text)
{
    if (row < 0)
        return;
    const int existing = find(row);
    if (existing >= 0)
        m_entries.remove(existing);
    Entry entry;
    if (QAbstractItemModel *items = model())
        entry.index = QPersistentModelIndex(items->index(row, 0));
    else
        entry.row = row;
    entry.deadline = m_clock.elapsed() + qMax(0, timeout);
    entry.action = action;
    entry.text = text;
    m_entries.append(entry);
    schedule();
    if (existing < 0)
        Q_EMIT countChanged();
    Q_EMIT started(row);
}

void RemorseCache::cancel(int row)
{
    const int at = find(row);
    if (at < 0)
        return;
    m_entries.remove(at);
    schedule();
    Q_EMIT countChanged();
    Q_EMIT canceled(row);
}

bool RemorseCache::running(int row) const
{
    return find(row) >= 0;
}

int RemorseCache::remaining(int row) const
{
    const int at = find(row);
    return at < 0 ? 0 : int(qMax<qint64>(0, m_entries.at(at).deadline - m_clock.elapsed()));
}

QString RemorseCache::text(int row) const
{
    const int at = find(row);
    return at < 0 ? QString() : m_entries.at(at).text;
}

void RemorseCache::schedule()
{
    // Rows removed from the model meanwhile go without running anything.
    const int before = m_entries.size();
    for (int i = m_entries.size() - 1; i >= 0; --i) {
        if (m_entries.at(i).row < 0 && !m_entries.at(i).index.isValid())
            m_entries.remove(i);
    }
    if (m_entries.size() != before)
        Q_EMIT countChanged();
    if (m_entries.isEmpty()) {
        m_timer.stop();
        return;
    }
    qint64 next = m_entries.first().deadline;
    for (const Entry &entry : qAsConst(m_entries))
        next = qMin(next, entry.deadline);
    m_timer.start(int(qMax<qint64>(0, next - m_clock.elapsed())));
}

void RemorseCache::fire()
{
    const qint64 now = m_clock.elapsed();
    QPointer<RemorseCache> self(this);
    // Take what is due first: an action may start or cancel others.
    QVector<Entry> due;
    for (int i = m_entries.size() - 1; i >= 0; --i) {
        const Entry &entry = m_entries.at(i);
        if (entry.deadline <= now && (entry.row >= 0 || entry.index.isValid())) {
            due.prepend(entry);
            m_entries.remove(i);
        }
    }
    if (!due.isEmpty())
        Q_EMIT countChanged();
    for (Entry &entry : due) {
        const int row = rowOf(entry);
        if (entry.action.isCallable())
            entry.action.call();
        if (!self)
            return;
        Q_EMIT triggered(row);
    }
    schedule();
}
