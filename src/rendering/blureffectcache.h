#pragma once

#include <QHash>
#include <QMutex>
#include <QObject>
#include <QPointer>

#include <memory>

class BlurEffectShaderProgram;
class QQuickWindow;

// The blur programs of one window, one per kernel, made on first use on the window's
// render thread and destroyed there when the window's scene graph goes away.
class BlurEffectCache : public QObject
{
    Q_OBJECT

public:
    ~BlurEffectCache() override;

    // The cache of a window (render thread); made when missing.
    static BlurEffectCache *forWindow(QQuickWindow *window);

    // The program for a kernel, or null when it does not compile.
    BlurEffectShaderProgram *program(int kernel);

private:
    explicit BlurEffectCache(QQuickWindow *window);

    QPointer<QQuickWindow> m_window;
    QHash<int, std::shared_ptr<BlurEffectShaderProgram>> m_programs;

    static QMutex s_mutex;
    static QHash<QQuickWindow *, BlurEffectCache *> s_caches;
};
