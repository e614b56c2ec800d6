#pragma once

#include <QHash>
#include <QMutex>
#include <QObject>
#include <QPointer>

#include <memory>

class BlurEffectShaderProgram;
class QOpenGLContext;
class QQuickWindow;

// The blur programs of one GL context (shared by the windows that render with it), one
// per kernel, made on first use on the render thread and destroyed with the context.
class BlurEffectCache : public QObject
{
    Q_OBJECT

public:
    ~BlurEffectCache() override;

    // The cache of the context the window renders with (render thread, the context
    // current); made when missing.
    static BlurEffectCache *forWindow(QQuickWindow *window);

    // Caches there are now (one per GL context that drew a blur).
    static int cacheCount();

    // The program for a kernel, or null when it does not compile.
    BlurEffectShaderProgram *program(int kernel);

private:
    explicit BlurEffectCache(QQuickWindow *window);

    QHash<int, std::shared_ptr<BlurEffectShaderProgram>> m_programs;

    static QMutex s_mutex;
    static QHash<QOpenGLContext *, BlurEffectCache *> s_caches;
};
