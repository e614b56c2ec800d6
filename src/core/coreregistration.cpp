#include "coreregistration.h"
#include "control.h"
#include "item.h"
#include "screen.h"
#include "theme.h"

#include <QQmlEngine>

namespace Pelkan {
namespace Private {

void registerTypes(const char *uri)
{
    // Properties typed with the core classes, such as Control.palette, work in any document.
    qmlRegisterAnonymousType<Item>(uri, 1);
    qmlRegisterAnonymousType<Control>(uri, 1);
}

void registerPrivateTypes(const char *uri)
{
    // Bases the toolkit's own QML components are written on.
    qmlRegisterType<Item>(uri, 1, 0, "ItemBase");
    qmlRegisterType<Control>(uri, 1, 0, "ControlBase");
}

void initializeEngine(QQmlEngine *, const char *)
{
    // Make the process-wide theme and screen on the GUI thread, before image loader
    // threads resolve theme icons against them.
    Theme::instance();
    Screen::instance();
}

} // namespace Private
} // namespace Pelkan
