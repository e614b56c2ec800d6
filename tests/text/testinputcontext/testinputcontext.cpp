#include "testinputcontext.h"

#include <QCoreApplication>
#include <QGuiApplication>
#include <QInputMethodEvent>

void TestInputContext::update(Qt::InputMethodQueries queries)
{
    if (queries & Qt::ImPlatformData)
        ++m_platformDataUpdates;
}

void TestInputContext::compose(const QString &text)
{
    m_preedit = text;
    if (QObject *focus = QGuiApplication::focusObject()) {
        QInputMethodEvent event(text, { QInputMethodEvent::Attribute(QInputMethodEvent::Cursor, text.size(), 1) });
        QCoreApplication::sendEvent(focus, &event);
    }
    Q_EMIT preeditChanged();
}

void TestInputContext::commit()
{
    if (m_preedit.isEmpty())
        return;
    const QString text = m_preedit;
    m_preedit.clear();
    if (QObject *focus = QGuiApplication::focusObject()) {
        QInputMethodEvent event;
        event.setCommitString(text);
        QCoreApplication::sendEvent(focus, &event);
    }
    Q_EMIT preeditChanged();
}

void TestInputContext::reset()
{
    m_preedit.clear();
    Q_EMIT preeditChanged();
}
