#include "autofill.h"
#include "text/autofilldatabase.h"
#include "text/inputmethodextensions.h"

#include <QCoreApplication>
#include <QQmlInfo>
#include <QTimerEvent>

namespace {
const int TypingDelay = 200;
} // namespace

AutoFill::AutoFill(QObject *parent)
    : QObject(parent)
{
    if (QCoreApplication *app = QCoreApplication::instance())
        connect(app, &QCoreApplication::aboutToQuit, this, &AutoFill::save);
}

AutoFill::~AutoFill()
{
    save();
}

AutoFill *AutoFill::qmlAttachedProperties(QObject *object)
{
    auto fill = new AutoFill(object);
    // An attached object is complete once made; its field is what it is attached to.
    fill->componentComplete();
    return fill;
}

void AutoFill::componentComplete()
{
    m_complete = true;
    if (!m_inputItemSet)
        attachInputItem(findInputItem());
    if (!m_key.isEmpty())
        scheduleRefresh(0);
}

void AutoFill::setKey(const QString &key)
{
    const QString sanitised = AutoFillDatabase::sanitisedKey(key);
    if (sanitised == m_key)
        return;
    m_key = sanitised;
    Q_EMIT keyChanged();
    if (m_key.isEmpty())
        m_refreshTimer.stop();
    else if (m_complete)
        scheduleRefresh(0);
}

void AutoFill::setPartialText(const QString &text)
{
    const QString simplified = text.simplified();
    if (simplified == m_partialText)
        return;
    m_partialText = simplified;
    Q_EMIT partialTextChanged();
    scheduleRefresh(TypingDelay);
}

void AutoFill::setMaximumSuggestions(int maximum)
{
    maximum = qMax(0, maximum);
    if (maximum == m_maximumSuggestions)
        return;
    m_maximumSuggestions = maximum;
    Q_EMIT maximumSuggestionsChanged();
    scheduleRefresh(0);
}

void AutoFill::setCanRemove(bool canRemove)
{
    if (canRemove == m_canRemove)
        return;
    m_canRemove = canRemove;
    publishHints();
    Q_EMIT canRemoveChanged();
}

void AutoFill::setSuggestions(const QStringList &suggestions)
{
    if (suggestions == m_suggestions)
        return;
    m_suggestions = suggestions;
    publishHints();
    Q_EMIT suggestionsChanged();
}

void AutoFill::resetSuggestions()
{
    refresh();
}

void AutoFill::setInputItem(QQuickItem *item)
{
    m_inputItemSet = true;
    attachInputItem(item);
}

void AutoFill::resetInputItem()
{
    m_inputItemSet = false;
    attachInputItem(findInputItem());
}

QQuickItem *AutoFill::findInputItem() const
{
    for (QObject *ancestor = parent(); ancestor; ancestor = ancestor->parent()) {
        auto item = qobject_cast<QQuickItem *>(ancestor);
        if (item && item->metaObject()->indexOfProperty("text") >= 0)
            return item;
    }
    return nullptr;
}

void AutoFill::attachInputItem(QQuickItem *item)
{
    if (item == m_inputItem)
        return;
    if (m_inputItem)
        disconnect(m_inputItem, nullptr, this, nullptr);
    m_inputItem = item;
    if (item) {
        const QMetaProperty text = item->metaObject()->property(item->metaObject()->indexOfProperty("text"));
        if (text.hasNotifySignal())
            connect(item, text.notifySignal(), this, metaObject()->method(metaObject()->indexOfSlot("sourceTextChanged()")));
        sourceTextChanged();
        publishHints();
    }
    Q_EMIT inputItemChanged();
}

void AutoFill::sourceTextChanged()
{
    if (m_inputItem)
        setPartialText(m_inputItem->property("text").toString());
}

void AutoFill::insert(const QString &suggestion)
{
    const QString simplified = suggestion.simplified();
    if (m_key.isEmpty()) {
        qmlInfo(this) << "Cannot insert auto fill suggestions for an invalid key";
        return;
    }
    if (simplified.isEmpty()) {
        qmlInfo(this) << "Cannot insert empty auto fill suggestions";
        return;
    }
    if (AutoFillDatabase::instance()->insert(m_key, simplified))
        scheduleRefresh(TypingDelay);
}

void AutoFill::remove(const QString &suggestion)
{
    const QString simplified = suggestion.simplified();
    if (m_key.isEmpty()) {
        qmlInfo(this) << "Cannot remove from a model with no key specified";
        return;
    }
    AutoFillDatabase::instance()->remove(m_key, simplified);
    if (m_suggestions.contains(simplified)) {
        QStringList remaining = m_suggestions;
        remaining.removeOne(simplified);
        setSuggestions(remaining);
        Q_EMIT suggestionRemoved(simplified);
    }
}

void AutoFill::save()
{
    AutoFillDatabase::instance()->save();
}

void AutoFill::scheduleRefresh(int msec)
{
    if (m_key.isEmpty() || !m_complete)
        return;
    m_refreshTimer.start(msec, this);
}

void AutoFill::timerEvent(QTimerEvent *event)
{
    if (event->timerId() != m_refreshTimer.timerId())
        return QObject::timerEvent(event);
    m_refreshTimer.stop();
    refresh();
}

void AutoFill::refresh()
{
    if (m_key.isEmpty())
        return;
    setSuggestions(visibleSuggestions(AutoFillDatabase::instance()->suggestions(m_key), m_partialText, m_maximumSuggestions));
}

QStringList AutoFill::visibleSuggestions(const QStringList &stored, const QString &partial, int maximum)
{
    if (partial.isEmpty())
        return stored.mid(0, maximum);
    QStringList visible;
    for (const QString &entry : stored) {
        if (visible.size() >= maximum)
            break;
        if (entry != partial && entry.contains(partial, Qt::CaseInsensitive))
            visible.append(entry);
    }
    return visible;
}

void AutoFill::publishHints()
{
    QObject *editor = InputMethodExtensions::findEditor(m_inputItem);
    InputMethodExtensions::setValue(editor, QStringLiteral("autoFillSuggestions"), m_suggestions);
    InputMethodExtensions::setValue(editor, QStringLiteral("autoFillCanRemove"), m_canRemove);
}
