#include "windowpropertypublisher.h"

#include <QGuiApplication>
#include <QWindow>
#include <qpa/qplatformnativeinterface.h>

namespace {

struct TestRoute {
    WindowPropertyPublisher::Sink sink;
    QString platformName;
};

TestRoute &testRoute()
{
    static TestRoute route;
    return route;
}

} // namespace

bool WindowPropertyPublisher::isWayland()
{
    if (testRoute().sink && !testRoute().platformName.isEmpty())
        return testRoute().platformName == QLatin1String("wayland");
    // The platform of a process never changes.
    static const bool wayland = QGuiApplication::platformName() == QLatin1String("wayland");
    return wayland;
}

bool WindowPropertyPublisher::canPublish(const QWindow *window)
{
    return window && window->handle() && isWayland();
}

void WindowPropertyPublisher::setProperty(QWindow *window, const QString &name, const QVariant &value)
{
    if (!canPublish(window))
        return;
    if (testRoute().sink) {
        testRoute().sink(window, name, value);
        return;
    }
    if (QPlatformNativeInterface *native = QGuiApplication::platformNativeInterface())
        native->setWindowProperty(window->handle(), name, value);
}

void WindowPropertyPublisher::setRetainCover(QWindow *window, bool retain)
{
    setProperty(window, QStringLiteral("QUORVANE_RETAIN_COVER"), retain);
}

void WindowPropertyPublisher::setSinkForTesting(const Sink &sink, const QString &platformName)
{
    testRoute().sink = sink;
    testRoute().platformName = platformName;
}
