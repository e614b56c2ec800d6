#pragma once

#include <QPointer>
#include <QQuickItem>

// Switches on the layer of an item that an effect reads but that is no texture provider of
// its own, and switches it off again when the last effect that switched it on lets go;
// a layer that was on already (the application's) is left alone. Effects on the same item
// share the layer: one letting go does not take it from the others. GUI thread only.
class SourceLayer
{
public:
    ~SourceLayer() { release(); }

    void hold(QQuickItem *item);
    void release();

private:
    QPointer<QQuickItem> m_item; // the item whose layer this holds
};
