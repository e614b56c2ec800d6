#include "configvalue.h"

#include <QtMath>

#include <limits>

namespace ConfigValue {

namespace {

bool isInteger(int type)
{
    switch (type) {
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::LongLong:
    case QMetaType::ULongLong:
    case QMetaType::Short:
    case QMetaType::UShort:
    case QMetaType::UChar:
    case QMetaType::SChar:
        return true;
    default:
        return false;
    }
}

} // namespace

bool toInt(const QVariant &value, int *result)
{
    const int type = value.userType();
    if (!isInteger(type))
        return false;
    if (type == QMetaType::ULongLong) {
        const qulonglong number = value.toULongLong();
        if (number > qulonglong(std::numeric_limits<int>::max()))
            return false;
        *result = int(number);
        return true;
    }
    const qlonglong number = value.toLongLong();
    if (number < std::numeric_limits<int>::min() || number > std::numeric_limits<int>::max())
        return false;
    *result = int(number);
    return true;
}

bool toReal(const QVariant &value, qreal *result)
{
    const int type = value.userType();
    if (type != QMetaType::Double && type != QMetaType::Float && !isInteger(type))
        return false;
    const qreal number = value.toReal();
    if (!qIsFinite(number))
        return false;
    *result = number;
    return true;
}

bool toString(const QVariant &value, QString *result)
{
    if (value.userType() != QMetaType::QString)
        return false;
    *result = value.toString();
    return true;
}

} // namespace ConfigValue
