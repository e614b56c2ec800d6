#pragma once

#include <QObject>
#include <QUrl>

// One button on a cover. triggered() is emitted when the home screen presses it.
class DeclarativeCoverAction : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QUrl iconSource READ iconSource WRITE setIconSource NOTIFY iconSourceChanged)

public:
    explicit DeclarativeCoverAction(QObject *parent = nullptr);

    QUrl iconSource() const { return m_iconSource; }
    void setIconSource(const QUrl &source);

Q_SIGNALS:
    void iconSourceChanged();
    void triggered();

private:
    QUrl m_iconSource;
};
