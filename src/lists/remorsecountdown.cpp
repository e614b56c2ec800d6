#include "remorsecountdown.h"
#include "remorsecache.h"

RemorseCountdown::RemorseCountdown(RemorseCache *cache, int row, const QPersistentModelIndex &index, int timeout,
                                   const QJSValue &action, const QString &text)
    : QObject(cache)
    , m_cache(cache)
    , m_index(index)
    , m_tracked(index.isValid())
    , m_row(row)
    , m_timeout(qMax(0, timeout))
    , m_action(action)
    , m_text(text)
{
    m_clock.start();
}

int RemorseCountdown::remaining() const
{
    return m_ended ? 0 : int(qMax<qint64>(0, m_timeout - m_clock.elapsed()));
}

void RemorseCountdown::cancel()
{
    if (!m_ended)
        m_cache->end(this, RemorseCache::Canceled);
}

bool RemorseCountdown::follow()
{
    if (!m_tracked)
        return true;
    if (!m_index.isValid())
        return false;
    if (m_index.row() != m_row) {
        m_row = m_index.row();
        Q_EMIT rowChanged();
    }
    return true;
}
