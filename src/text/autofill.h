#pragma once

#include <QBasicTimer>
#include <QObject>
#include <QPointer>
#include <QQmlParserStatus>
#include <QQuickItem>
#include <QStringList>
#include <qqml.h>

// Remembers what the user typed into a field under a key and offers it back, filtered by
// what is being typed now. Usable as an object inside a field or attached to it
// (AutoFill.key: "email").
//
// Decisions:
// - The field (inputItem) is, unless set, the nearest ancestor item with a "text"
//   property; its text is the partial text the suggestions are filtered by.
// - The visible suggestions and canRemove are written into the field's input-method hints
//   ("autoFillSuggestions", "autoFillCanRemove") whenever they change, for the keyboard.
// - Changed lists are saved by save(), when an AutoFill object is destroyed and when the
//   application quits.
class AutoFill : public QObject, public QQmlParserStatus
{
    Q_OBJECT
    Q_INTERFACES(QQmlParserStatus)
    Q_PROPERTY(QString key READ key WRITE setKey NOTIFY keyChanged)
    Q_PROPERTY(QString partialText READ partialText WRITE setPartialText RESET resetPartialText NOTIFY partialTextChanged)
    Q_PROPERTY(int maximumSuggestions READ maximumSuggestions WRITE setMaximumSuggestions NOTIFY maximumSuggestionsChanged)
    Q_PROPERTY(bool canRemove READ canRemove WRITE setCanRemove NOTIFY canRemoveChanged)
    Q_PROPERTY(QStringList suggestions READ suggestions WRITE setSuggestions RESET resetSuggestions NOTIFY suggestionsChanged)
    Q_PROPERTY(QQuickItem *inputItem READ inputItem WRITE setInputItem RESET resetInputItem NOTIFY inputItemChanged)

public:
    explicit AutoFill(QObject *parent = nullptr);
    ~AutoFill() override;

    static AutoFill *qmlAttachedProperties(QObject *object);

    QString key() const { return m_key; }
    void setKey(const QString &key);
    QString partialText() const { return m_partialText; }
    void setPartialText(const QString &text);
    void resetPartialText() { setPartialText(QString()); }
    int maximumSuggestions() const { return m_maximumSuggestions; }
    void setMaximumSuggestions(int maximum);
    bool canRemove() const { return m_canRemove; }
    void setCanRemove(bool canRemove);
    QStringList suggestions() const { return m_suggestions; }
    void setSuggestions(const QStringList &suggestions);
    void resetSuggestions();
    QQuickItem *inputItem() const { return m_inputItem; }
    void setInputItem(QQuickItem *item);
    void resetInputItem();

    void classBegin() override {}
    void componentComplete() override;

    // The suggestions of a stored list for a partial text.
    static QStringList visibleSuggestions(const QStringList &stored, const QString &partial, int maximum);

public Q_SLOTS:
    void insert(const QString &suggestion);
    void remove(const QString &suggestion);
    void save();

Q_SIGNALS:
    void keyChanged();
    void partialTextChanged();
    void maximumSuggestionsChanged();
    void canRemoveChanged();
    void suggestionsChanged();
    void inputItemChanged();
    void suggestionRemoved(const QString &suggestion);

protected:
    void timerEvent(QTimerEvent *event) override;

private Q_SLOTS:
    void sourceTextChanged();

private:
    void scheduleRefresh(int msec);
    void refresh();
    void attachInputItem(QQuickItem *item);
    QQuickItem *findInputItem() const;
    void publishHints();

    QString m_key;
    QString m_partialText;
    int m_maximumSuggestions = 10;
    bool m_canRemove = false;
    QStringList m_suggestions;
    QPointer<QQuickItem> m_inputItem;
    bool m_inputItemSet = false;
    bool m_complete = false;
    QBasicTimer m_refreshTimer;
};

QML_DECLARE_TYPEINFO(AutoFill, QML_HAS_ATTACHED_PROPERTIES)
