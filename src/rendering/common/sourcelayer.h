#pragma once

#include <QPointer>
#include <QQuickItem>

// Switches on the layer of an item that an effect reads but that is no texture provider of
// its own, and switches it off again when the effect lets go, unless it was on already.
class SourceLayer
{
public:
    ~SourceLayer() { release(); }

    void hold(QQuickItem *item);
    void release();

private:
    QPointer<QQuickItem> m_item; // the item whose layer this switched on
};
