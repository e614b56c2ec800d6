#include "windowpropertypublisher.h"

#include <QGuiApplication>
#include <QHash>
#include <QPair>
#include <QWindow>
#include <qpa/qplatformnativeinterface.h>

namespace {

struct TestRoute {
    WindowPropertyPublisher::Sink sink;
    QString platformName;
    QHash<QPair<const QWindow *, QString>, QVariant> written;
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
        testRoute().written.insert(qMakePair(static_cast<const QWindow *>(window), name), value);
        testRoute().sink(window, name, value);
        return;
    }
    if (QPlatformNativeInterface *native = QGuiApplication::platformNativeInterface())
        native->setWindowProperty(window->handle(), name, value);
}

QVariant WindowPropertyPublisher::property(QWindow *window, const QString &name)
{
    if (!canPublish(window))
        return QVariant();
    if (testRoute().sink)
        return testRoute().written.value(qMakePair(static_cast<const QWindow *>(window), name));
    QPlatformNativeInterface *native = QGuiApplication::platformNativeInterface();
    return native ? native->windowProperty(window->handle(), name) : QVariant();
}

void WindowPropertyPublisher::setRetainCover(QWindow *window, bool retain)
{
    setProperty(window, QStringLiteral("QUORVANE_RETAIN_COVER"), retain);
}

void WindowPropertyPublisher::setSinkForTesting(const Sink &sink, const QString &platformName)
{
    testRoute().sink = sink;
    testRoute().platformName = platformName;
    testRoute().written.clear();
}
