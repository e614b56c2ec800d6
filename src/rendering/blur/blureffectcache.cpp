#include "blureffectcache.h"
#include "rendering/blur/blureffectshaderprogram.h"
#include "rendering/common/renderresourcerelease.h"

#include <QOpenGLContext>
#include <QQuickWindow>

QMutex BlurEffectCache::s_mutex;
QHash<QOpenGLContext *, BlurEffectCache *> BlurEffectCache::s_caches;

BlurEffectCache::BlurEffectCache(QQuickWindow *window)
{
    RenderResourceRelease::watch(window, this, [this] { delete this; });
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
    QOpenGLContext *context = QOpenGLContext::currentContext();
    if (!window || !context)
        return nullptr;
    QMutexLocker lock(&s_mutex);
    BlurEffectCache *&cache = s_caches[context];
    if (!cache)
        cache = new BlurEffectCache(window);
    return cache;
}

int BlurEffectCache::cacheCount()
{
    QMutexLocker lock(&s_mutex);
    return s_caches.size();
}

BlurEffectShaderProgram *BlurEffectCache::program(int kernel)
{
    std::shared_ptr<BlurEffectShaderProgram> &program = m_programs[kernel];
    if (!program)
        program = std::make_shared<BlurEffectShaderProgram>(kernel);
    return program->isValid() ? program.get() : nullptr;
}
