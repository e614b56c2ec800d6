#pragma once

#include <QObject>
#include <QPointer>
#include <QQmlParserStatus>

// Placed inside a text editor: `text` is the editor's text with the keyboard's pending
// composition inserted at the cursor, so QML can show what is being typed before it is
// committed. Writing `text` commits the composition first, then replaces the text.
class DeclarativePreeditText : public QObject, public QQmlParserStatus
{
    Q_OBJECT
    Q_INTERFACES(QQmlParserStatus)
    Q_PROPERTY(QString text READ text WRITE setText NOTIFY textChanged)

public:
    explicit DeclarativePreeditText(QObject *parent = nullptr);

    QString text() const;
    void setText(const QString &text);

    void classBegin() override {}
    void componentComplete() override;

    // The platform's input context (what input-method plugins create), or null.
    static QObject *platformInputContext();

Q_SIGNALS:
    void textChanged();

private Q_SLOTS:
    void handleFocusChanged(bool focus);

private:
    void setEditor(QObject *editor);

    QPointer<QObject> m_editor;
};
