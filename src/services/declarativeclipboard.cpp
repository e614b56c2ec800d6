#include "declarativeclipboard.h"

#include <QClipboard>
#include <QGuiApplication>

DeclarativeClipboard::DeclarativeClipboard(QObject *parent)
    : QObject(parent)
{
    QClipboard *clipboard = QGuiApplication::clipboard();
    connect(clipboard, &QClipboard::dataChanged, this, &DeclarativeClipboard::clipboardChanged);
    m_text = clipboard->text();
    m_hasText = !m_text.isEmpty();
}

QString DeclarativeClipboard::text() const
{
    return m_text;
}

void DeclarativeClipboard::setText(const QString &text)
{
    // The notification follows from the clipboard itself.
    QGuiApplication::clipboard()->setText(text);
}

void DeclarativeClipboard::clipboardChanged()
{
    const QString text = QGuiApplication::clipboard()->text();
    if (text == m_text)
        return;
    const bool had = m_hasText;
    m_text = text;
    m_hasText = !text.isEmpty();
    Q_EMIT textChanged();
    if (had != m_hasText)
        Q_EMIT hasTextChanged();
}
