#include "propertypin.h"

PropertyPin::PropertyPin(QObject *object, const QMetaProperty &property, const QVariant &value)
    : QObject(object)
    , m_object(object)
    , m_property(property)
    , m_value(value)
{
    m_property.write(m_object, m_value);
    m_pinned = m_property.read(m_object);
    if (m_property.hasNotifySignal())
        QMetaObject::connect(m_object, m_property.notifySignalIndex(), this, staticMetaObject.indexOfSlot("restore()"));
}

void PropertyPin::restore()
{
    if (m_restoring || m_property.read(m_object) == m_pinned)
        return;
    m_restoring = true;
    m_property.write(m_object, m_value);
    m_restoring = false;
}
