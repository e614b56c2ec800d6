#include "blureffectcache.h"
#include "blureffectshaderprogram.h"

#include <QQuickWindow>

QMutex BlurEffectCache::s_mutex;
QHash<QQuickWindow *, BlurEffectCache *> BlurEffectCache::s_caches;

BlurEffectCache::BlurEffectCache(QQuickWindow *window)
    : m_window(window)
{
    // Emitted on the render thread with the context still current: programs go there.
    connect(window, &QQuickWindow::sceneGraphInvalidated, this, [this] {
        {
            QMutexLocker lock(&s_mutex);
            s_caches.remove(m_window);
        }
        delete this;
    }, Qt::DirectConnection);
}

BlurEffectCache::~BlurEffectCache()
{
    QMutexLocker lock(&s_mutex);
    for (auto it = s_caches.begin(); it != s_caches.end(); ++it) {
        if (it.value() == this) {
            s_caches.erase(it);
            break;
        }
    }
}

BlurEffectCache *BlurEffectCache::forWindow(QQuickWindow *window)
{
    QMutexLocker lock(&s_mutex);
    BlurEffectCache *&cache = s_caches[window];
    if (!cache)
        cache = new BlurEffectCache(window);
    return cache;
}

BlurEffectShaderProgram *BlurEffectCache::program(int kernel)
{
    std::shared_ptr<BlurEffectShaderProgram> &program = m_programs[kernel];
    if (!program)
        program = std::make_shared<BlurEffectShaderProgram>(kernel);
    return program->isValid() ? program.get() : nullptr;
}
