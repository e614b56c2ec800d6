#include "slide.h"

#include "views/slideable.h"

Slide::Slide(QObject *parent)
    : QObject(parent)
{
}

Slide *Slide::qmlAttachedProperties(QObject *object)
{
    return new Slide(object);
}

Slideable *Slide::view() const
{
    return m_view;
}

void Slide::setKeepAlive(bool keep)
{
    if (keep == m_keepAlive)
        return;
    m_keepAlive = keep;
    Q_EMIT keepAliveChanged();
}

void Slide::update(Slideable *view, int index, qreal offset, bool current, bool exposed,
                   QQuickItem *forward, QQuickItem *backward)
{
    if (view != m_view) {
        m_view = view;
        Q_EMIT viewChanged();
    }
    if (index != m_index) {
        m_index = index;
        Q_EMIT indexChanged();
    }
    if (offset != m_offset) {
        m_offset = offset;
        Q_EMIT offsetChanged();
    }
    if (current != m_current) {
        m_current = current;
        Q_EMIT isCurrentChanged();
    }
    if (exposed != m_exposed) {
        m_exposed = exposed;
        Q_EMIT exposedChanged();
    }
    if (forward != m_forward || backward != m_backward) {
        m_forward = forward;
        m_backward = backward;
        Q_EMIT neighboursChanged();
    }
}
