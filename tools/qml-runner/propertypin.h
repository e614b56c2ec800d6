#pragma once

#include <QMetaProperty>
#include <QObject>
#include <QVariant>

// Keeps a property of an object at a given value: whenever it changes (a window taking the
// screen's orientation once it is shown, say), the value is written back.
class PropertyPin : public QObject
{
    Q_OBJECT

public:
    // Writes the value now and after every change; the pin belongs to the object.
    PropertyPin(QObject *object, const QMetaProperty &property, const QVariant &value);

private Q_SLOTS:
    void restore();

private:
    QObject *m_object;
    QMetaProperty m_property;
    QVariant m_value;
    // What the property reads once the value is written (a setter may convert it).
    QVariant m_pinned;
    bool m_restoring = false;
};
