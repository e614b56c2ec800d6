// Configuration values of any type and text, as `dconf write` takes them, through the
// conversion to Qt values and the strict readings.
#include "configvalue.h"
#include "fuzzinput.h"
#include "gvariantconversion.h"

#include <glib.h>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    FuzzInput in(data, size);
    const QByteArray text = in.restBytes();
    GVariant *value = g_variant_parse(nullptr, text.constData(), text.constData() + text.size(), nullptr, nullptr);
    if (!value)
        return 0;
    g_variant_ref_sink(value);
    const QVariant converted = Pelkan::GVariantConversion::toQVariant(value);
    int number = 0;
    qreal real = 0;
    QString string;
    ConfigValue::toInt(converted, &number);
    ConfigValue::toReal(converted, &real);
    ConfigValue::toString(converted, &string);
    if (GVariant *back = Pelkan::GVariantConversion::fromQVariant(converted)) {
        g_variant_ref_sink(back);
        g_variant_unref(back);
    }
    g_variant_unref(value);
    return 0;
}
