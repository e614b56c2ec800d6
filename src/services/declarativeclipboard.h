#pragma once

#include <QObject>
#include <QString>

// The system clipboard's text, for QML: Clipboard.text = field.selectedText. Follows
// changes made by other applications.
class DeclarativeClipboard : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString text READ text WRITE setText NOTIFY textChanged)
    Q_PROPERTY(bool hasText READ hasText NOTIFY hasTextChanged)

public:
    explicit DeclarativeClipboard(QObject *parent = nullptr);

    QString text() const;
    void setText(const QString &text);
    bool hasText() const { return m_hasText; }

Q_SIGNALS:
    void textChanged();
    void hasTextChanged();

private:
    void clipboardChanged();

    QString m_text;
    bool m_hasText = false;
};
