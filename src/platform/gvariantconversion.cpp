#include "gvariantconversion.h"

#include <QStringList>
#include <QVariantMap>

#include <glib.h>

namespace Pelkan {
namespace GVariantConversion {

QVariant toQVariant(GVariant *value)
{
    if (!value)
        return QVariant();

    switch (g_variant_classify(value)) {
    case G_VARIANT_CLASS_BOOLEAN:
        return bool(g_variant_get_boolean(value));
    case G_VARIANT_CLASS_BYTE:
        return int(g_variant_get_byte(value));
    case G_VARIANT_CLASS_INT16:
        return int(g_variant_get_int16(value));
    case G_VARIANT_CLASS_UINT16:
        return int(g_variant_get_uint16(value));
    case G_VARIANT_CLASS_INT32:
        return int(g_variant_get_int32(value));
    case G_VARIANT_CLASS_UINT32:
        return uint(g_variant_get_uint32(value));
    case G_VARIANT_CLASS_INT64:
        return qlonglong(g_variant_get_int64(value));
    case G_VARIANT_CLASS_UINT64:
        return qulonglong(g_variant_get_uint64(value));
    case G_VARIANT_CLASS_DOUBLE:
        return g_variant_get_double(value);
    case G_VARIANT_CLASS_STRING:
    case G_VARIANT_CLASS_OBJECT_PATH:
    case G_VARIANT_CLASS_SIGNATURE:
        return QString::fromUtf8(g_variant_get_string(value, nullptr));
    case G_VARIANT_CLASS_VARIANT: {
        GVariant *inner = g_variant_get_variant(value);
        const QVariant result = toQVariant(inner);
        g_variant_unref(inner);
        return result;
    }
    case G_VARIANT_CLASS_ARRAY:
        if (g_variant_is_of_type(value, G_VARIANT_TYPE_STRING_ARRAY)) {
            QStringList list;
            gsize length = 0;
            const gchar **strings = g_variant_get_strv(value, &length);
            for (gsize i = 0; i < length; ++i)
                list.append(QString::fromUtf8(strings[i]));
            g_free(strings);
            return list;
        }
        if (g_variant_is_of_type(value, G_VARIANT_TYPE("a{s*}"))) {
            QVariantMap map;
            GVariantIter iter;
            g_variant_iter_init(&iter, value);
            while (GVariant *entry = g_variant_iter_next_value(&iter)) {
                GVariant *key = g_variant_get_child_value(entry, 0);
                GVariant *item = g_variant_get_child_value(entry, 1);
                map.insert(QString::fromUtf8(g_variant_get_string(key, nullptr)), toQVariant(item));
                g_variant_unref(item);
                g_variant_unref(key);
                g_variant_unref(entry);
            }
            return map;
        } else {
            QVariantList list;
            GVariantIter iter;
            g_variant_iter_init(&iter, value);
            while (GVariant *item = g_variant_iter_next_value(&iter)) {
                list.append(toQVariant(item));
                g_variant_unref(item);
            }
            return list;
        }
    default:
        return QVariant();
    }
}

static bool allOfType(const QVariantList &list, int type)
{
    for (const QVariant &item : list) {
        if (item.userType() != type)
            return false;
    }
    return true;
}

GVariant *fromQVariant(const QVariant &value)
{
    switch (value.userType()) {
    case QMetaType::Bool:
        return g_variant_new_boolean(value.toBool());
    case QMetaType::Int:
    case QMetaType::Short:
    case QMetaType::Char:
    case QMetaType::SChar:
    case QMetaType::UChar:
    case QMetaType::UShort:
        return g_variant_new_int32(value.toInt());
    case QMetaType::UInt:
        return g_variant_new_uint32(value.toUInt());
    case QMetaType::Long:
    case QMetaType::LongLong:
        return g_variant_new_int64(value.toLongLong());
    case QMetaType::ULong:
    case QMetaType::ULongLong:
        return g_variant_new_uint64(value.toULongLong());
    case QMetaType::Double:
    case QMetaType::Float:
        return g_variant_new_double(value.toDouble());
    case QMetaType::QString:
    case QMetaType::QByteArray:
    case QMetaType::QColor:
    case QMetaType::QUrl:
        return g_variant_new_string(value.toString().toUtf8().constData());
    case QMetaType::QStringList: {
        const QStringList strings = value.toStringList();
        GVariantBuilder builder;
        g_variant_builder_init(&builder, G_VARIANT_TYPE_STRING_ARRAY);
        for (const QString &string : strings)
            g_variant_builder_add(&builder, "s", string.toUtf8().constData());
        return g_variant_builder_end(&builder);
    }
    case QMetaType::QVariantList: {
        const QVariantList list = value.toList();
        if (!list.isEmpty() && allOfType(list, QMetaType::QString))
            return fromQVariant(value.toStringList());
        GVariantBuilder builder;
        g_variant_builder_init(&builder, G_VARIANT_TYPE("av"));
        for (const QVariant &item : list) {
            GVariant *converted = fromQVariant(item);
            if (!converted) {
                g_variant_builder_clear(&builder);
                return nullptr;
            }
            g_variant_builder_add(&builder, "v", converted);
        }
        return g_variant_builder_end(&builder);
    }
    case QMetaType::QVariantMap: {
        const QVariantMap map = value.toMap();
        GVariantBuilder builder;
        g_variant_builder_init(&builder, G_VARIANT_TYPE("a{sv}"));
        for (auto it = map.cbegin(); it != map.cend(); ++it) {
            GVariant *converted = fromQVariant(it.value());
            if (!converted) {
                g_variant_builder_clear(&builder);
                return nullptr;
            }
            g_variant_builder_add(&builder, "{sv}", it.key().toUtf8().constData(), converted);
        }
        return g_variant_builder_end(&builder);
    }
    default:
        return nullptr;
    }
}

} // namespace GVariantConversion
} // namespace Pelkan
