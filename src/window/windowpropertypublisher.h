#pragma once

#include <QString>
#include <QVariant>

#include <functional>

class QWindow;

// Sets native window properties for the compositor. It is the only place that talks to
// the platform's native interface: properties are set only on the "wayland" platform and
// only on windows that have a native handle; everywhere else every call is a no-op.
class WindowPropertyPublisher
{
public:
    // Whether the application runs on the compositor that reads these properties.
    static bool isWayland();
    // Whether properties set on this window reach the compositor.
    static bool canPublish(const QWindow *window);
    static void setProperty(QWindow *window, const QString &name, const QVariant &value);
    // The value last set on the window, as the platform reports it (invalid when unset).
    static QVariant property(QWindow *window, const QString &name);

    // Asks the compositor to keep (or stop keeping) the window's cover while it is hidden.
    static void setRetainCover(QWindow *window, bool retain);

    // Tests: route properties to sink instead of the native interface (property() then
    // reads back what went there), and pretend the platform has the given name. An empty
    // sink restores the real behaviour.
    using Sink = std::function<void(QWindow *, const QString &, const QVariant &)>;
    static void setSinkForTesting(const Sink &sink, const QString &platformName = QString());

};
