#include "renderresourcerelease.h"

#include <QOpenGLContext>
#include <QQuickWindow>

#include <atomic>
#include <memory>

namespace RenderResourceRelease {

void watch(QQuickWindow *window, QObject *resource, std::function<void()> release)
{
    auto done = std::make_shared<std::atomic<bool>>(false);
    auto once = [done, release = std::move(release)] {
        if (!done->exchange(true))
            release();
    };
    QObject::connect(window, &QQuickWindow::sceneGraphInvalidated, resource, once, Qt::DirectConnection);
    // Qt does not make a context current to announce its end; the loop that owns it
    // usually still has it current then. Where it does not, GL names die with it.
    if (QOpenGLContext *context = QOpenGLContext::currentContext())
        QObject::connect(context, &QOpenGLContext::aboutToBeDestroyed, resource, once, Qt::DirectConnection);
}

} // namespace RenderResourceRelease
