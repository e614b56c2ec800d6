#include "remorsecache.h"
#include "remorsecountdown.h"
#include "core/pelkanlogging.h"

#include <QAbstractItemModel>
#include <QQmlEngine>

RemorseCache::RemorseCache(QObject *view)
    : QObject(view)
    , m_view(view)
{
    m_timer.setSingleShot(true);
    m_timer.setTimerType(Qt::PreciseTimer);
    connect(&m_timer, &QTimer::timeout, this, &RemorseCache::fire);
    if (view) {
        // Qt's views are private classes: their model signal is reached by name.
        const QMetaObject *meta = view->metaObject();
        const int signal = meta->indexOfSignal("modelChanged()");
        if (signal >= 0)
            connect(view, meta->method(signal), this, metaObject()->method(metaObject()->indexOfSlot("modelReplaced()")));
    }
    watchModel();
}

RemorseCache::~RemorseCache() = default;

RemorseCache *RemorseCache::qmlAttachedProperties(QObject *object)
{
    return new RemorseCache(object);
}

void RemorseCache::watchModel()
{
    if (m_model)
        disconnect(m_model, nullptr, this, nullptr);
    m_model = m_view ? qobject_cast<QAbstractItemModel *>(m_view->property("model").value<QObject *>()) : nullptr;
    if (!m_model)
        return;
    // Persistent indexes are up to date when these arrive.
    connect(m_model, &QAbstractItemModel::rowsInserted, this, &RemorseCache::followRows);
    connect(m_model, &QAbstractItemModel::rowsRemoved, this, &RemorseCache::followRows);
    connect(m_model, &QAbstractItemModel::rowsMoved, this, &RemorseCache::followRows);
    connect(m_model, &QAbstractItemModel::layoutChanged, this, &RemorseCache::followRows);
    connect(m_model, &QAbstractItemModel::modelReset, this, &RemorseCache::followRows);
    connect(m_model, &QObject::destroyed, this, [this] { endAll(Dropped); });
}

void RemorseCache::endAll(Ending ending)
{
    const QVector<RemorseCountdown *> running = m_countdowns;
    for (RemorseCountdown *countdown : running)
        end(countdown, ending);
}

void RemorseCache::modelReplaced()
{
    // Rows of the old model mean nothing in the new one. (A model that was destroyed has
    // ended its countdowns already.)
    endAll(Left);
    watchModel();
}

void RemorseCache::followRows()
{
    QVector<RemorseCountdown *> left;
    for (RemorseCountdown *countdown : qAsConst(m_countdowns)) {
        if (!countdown->follow() || !m_model)
            left.append(countdown);
    }
    for (RemorseCountdown *countdown : qAsConst(left))
        end(countdown, Left);
}

RemorseCountdown *RemorseCache::find(int row) const
{
    for (RemorseCountdown *countdown : m_countdowns) {
        if (countdown->row() == row)
            return countdown;
    }
    return nullptr;
}

QObject *RemorseCache::at(int row) const
{
    return find(row);
}

QObject *RemorseCache::start(int row, int timeout, const QJSValue &action, const QString &text)
{
    if (row < 0 || (m_model && row >= m_model->rowCount())) {
        qCWarning(lcPelkanCoreLog) << "RemorseCache: no row" << row << "to count down for";
        return nullptr;
    }
    if (RemorseCountdown *running = find(row))
        end(running, Canceled);
    const QPersistentModelIndex index = m_model ? QPersistentModelIndex(m_model->index(row, 0)) : QPersistentModelIndex();
    auto *countdown = new RemorseCountdown(this, row, index, timeout, action, text);
    QQmlEngine::setObjectOwnership(countdown, QQmlEngine::CppOwnership);
    m_countdowns.append(countdown);
    schedule();
    Q_EMIT countChanged();
    Q_EMIT started(row);
    return countdown;
}

void RemorseCache::cancel(int row)
{
    if (RemorseCountdown *countdown = find(row))
        end(countdown, Canceled);
}

void RemorseCache::end(RemorseCountdown *countdown, Ending ending)
{
    if (countdown->m_ended)
        return;
    countdown->m_ended = true;
    const int row = countdown->row();
    m_countdowns.removeOne(countdown);
    if (ending == Left) {
        qCWarning(lcPelkanCoreLog).nospace() << "RemorseCache: row " << row << " left the model during its countdown ("
                                             << countdown->text() << "); its action does not run";
    }
    countdown->m_row = -1;
    Q_EMIT countdown->rowChanged();
    schedule();

    QPointer<RemorseCache> self(this);
    QPointer<RemorseCountdown> guard(countdown);
    Q_EMIT countChanged();
    if (ending == Triggered) {
        QJSValue action = countdown->m_action;
        if (action.isCallable()) {
            const QJSValue result = action.call();
            if (result.isError())
                qCWarning(lcPelkanCoreLog) << "RemorseCache: the action of row" << row << "failed:" << result.toString();
        }
        if (guard)
            Q_EMIT countdown->triggered();
        if (self)
            Q_EMIT triggered(row);
    } else {
        if (guard)
            Q_EMIT countdown->canceled();
        if (self)
            Q_EMIT canceled(row);
    }
    if (guard)
        countdown->deleteLater();
}

void RemorseCache::schedule()
{
    if (m_countdowns.isEmpty()) {
        m_timer.stop();
        return;
    }
    int next = m_countdowns.first()->remaining();
    for (const RemorseCountdown *countdown : qAsConst(m_countdowns))
        next = qMin(next, countdown->remaining());
    m_timer.start(next);
}

void RemorseCache::fire()
{
    // Take what is due first: an action may start or cancel others.
    QVector<QPointer<RemorseCountdown>> due;
    for (RemorseCountdown *countdown : qAsConst(m_countdowns)) {
        if (countdown->remaining() == 0)
            due.append(countdown);
    }
    QPointer<RemorseCache> self(this);
    for (const QPointer<RemorseCountdown> &countdown : qAsConst(due)) {
        if (!self)
            return;
        if (countdown)
            end(countdown, Triggered);
    }
    if (self)
        schedule();
}
