#include "declarativecoveraction.h"

DeclarativeCoverAction::DeclarativeCoverAction(QObject *parent)
    : QObject(parent)
{
}

void DeclarativeCoverAction::setIconSource(const QUrl &source)
{
    if (source == m_iconSource)
        return;
    m_iconSource = source;
    Q_EMIT iconSourceChanged();
}
