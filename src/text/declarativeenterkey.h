#pragma once

#include <QObject>
#include <QUrl>
#include <qqml.h>

// Attached to a text field as EnterKey: tells the on-screen keyboard how to draw its
// Enter key, and emits clicked() when Enter or Return is released in the field. The
// values live in the editor's input-method hints, so every EnterKey attached to the same
// field sees the same values. enabled and highlighted announce nothing when written.
//
// QtQuick 2.6 and later attach an EnterKey of their own, with a `type`. Imported after
// QtQuick, this one takes the name in bindings and carries `type` too (kept on QtQuick's
// attached object, where the keyboard reads it), so one EnterKey group serves both.
class DeclarativeEnterKey : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QUrl iconSource READ iconSource WRITE setIconSource NOTIFY iconSourceChanged)
    Q_PROPERTY(QString text READ text WRITE setText NOTIFY textChanged)
    Q_PROPERTY(bool enabled READ enabled WRITE setEnabled NOTIFY enabledChanged)
    Q_PROPERTY(bool highlighted READ highlighted WRITE setHighlighted NOTIFY highlightedChanged)
    Q_PROPERTY(int type READ type WRITE setType NOTIFY typeChanged)

public:
    explicit DeclarativeEnterKey(QObject *parent = nullptr);
    ~DeclarativeEnterKey() override;

    static DeclarativeEnterKey *qmlAttachedProperties(QObject *object);

    QObject *editor() const { return m_editor; }

    QUrl iconSource() const;
    void setIconSource(const QUrl &source);
    QString text() const;
    void setText(const QString &text);
    bool enabled() const;
    void setEnabled(bool enabled);
    bool highlighted() const;
    void setHighlighted(bool highlighted);
    // A Qt::EnterKeyType; EnterKeyDefault where QtQuick offers no EnterKey of its own.
    int type() const;
    void setType(int type);

Q_SIGNALS:
    void iconSourceChanged();
    void textChanged();
    void enabledChanged();
    void highlightedChanged();
    void typeChanged();
    void clicked();

protected:
    bool eventFilter(QObject *object, QEvent *event) override;

private:
    void updateKeyFilter();
    QObject *quickEnterKey() const;

    QObject *m_editor = nullptr;
    QMetaObject::Connection m_editorGone;
};

QML_DECLARE_TYPEINFO(DeclarativeEnterKey, QML_HAS_ATTACHED_PROPERTIES)
