#include "buttonlayoutattached.h"

ButtonLayoutAttached::ButtonLayoutAttached(QObject *parent)
    : QObject(parent)
{
}

void ButtonLayoutAttached::setNewLine(bool newLine)
{
    if (newLine == m_newLine)
        return;
    m_newLine = newLine;
    Q_EMIT newLineChanged();
}
