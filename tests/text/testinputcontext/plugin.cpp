#include "testinputcontext.h"

#include <qpa/qplatforminputcontextplugin_p.h>

class TestInputContextPlugin : public QPlatformInputContextPlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID QPlatformInputContextFactoryInterface_iid FILE "testinputcontext.json")

public:
    QPlatformInputContext *create(const QString &key, const QStringList &) override
    {
        return key == QLatin1String("pelkantest") ? new TestInputContext : nullptr;
    }
};

#include "plugin.moc"
