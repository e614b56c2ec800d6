#pragma once

#include <functional>

class QObject;
class QQuickWindow;

// Render resources (an atlas texture, compiled programs) belong to the GL context they
// were made in, and are shared by every window that renders with it: each window in the
// threaded loop has a context of its own, while the basic loop renders all windows with
// one, and shares textures made for one window with the others. Such a resource goes
// when its context does:
// - when the window it was made for has its scene graph invalidated (render thread,
//   context current): in the threaded loop, when that window is destroyed or let go of
//   its context;
// - or just before the context itself is destroyed: in the basic loop, with the last
//   window, whichever window that is.
// release runs at most once and never after resource (its context object) is deleted; it
// usually deletes resource. Call on the render thread, with the context current.
namespace RenderResourceRelease {

void watch(QQuickWindow *window, QObject *resource, std::function<void()> release);

} // namespace RenderResourceRelease
