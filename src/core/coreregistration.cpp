#include "coreregistration.h"
#include "buttonbase.h"
#include "control.h"
#include "controlbase.h"
#include "item.h"
#include "rangebase.h"
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
    // Controls: behaviour here, look in the QML file completing them.
    qmlRegisterType<ControlBase>(uri, 1, 0, "ControlBase");
    qmlRegisterType<ButtonBase>(uri, 1, 0, "ButtonBase");
    qmlRegisterType<RangeBase>(uri, 1, 0, "RangeBase");
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
