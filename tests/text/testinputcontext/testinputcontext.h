#pragma once

#include <qpa/qplatforminputcontext.h>

// An input context that composes what the test asks for: compose("ab") sends the focus
// object a pre-edit of "ab", as a keyboard does while a word is being typed. It counts
// the platform-data updates the application asks for.
class TestInputContext : public QPlatformInputContext
{
    Q_OBJECT
    Q_PROPERTY(QString preedit READ preedit NOTIFY preeditChanged)
    Q_PROPERTY(int platformDataUpdates READ platformDataUpdates)

public:
    bool isValid() const override { return true; }
    void update(Qt::InputMethodQueries queries) override;
    void commit() override;
    void reset() override;

    QString preedit() const { return m_preedit; }
    int platformDataUpdates() const { return m_platformDataUpdates; }

    Q_INVOKABLE void compose(const QString &text);

Q_SIGNALS:
    void preeditChanged();

private:
    QString m_preedit;
    int m_platformDataUpdates = 0;
};
