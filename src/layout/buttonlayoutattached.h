#pragma once

#include <QObject>

// What a button in a ButtonLayout says about its place: `newLine` starts a new row with it.
class ButtonLayoutAttached : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool newLine READ newLine WRITE setNewLine NOTIFY newLineChanged)

public:
    explicit ButtonLayoutAttached(QObject *parent = nullptr);

    bool newLine() const { return m_newLine; }
    void setNewLine(bool newLine);

Q_SIGNALS:
    void newLineChanged();

private:
    bool m_newLine = false;
};
