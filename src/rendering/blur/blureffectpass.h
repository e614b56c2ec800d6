#pragma once

#include "rendering/blur/blureffecttexture.h"
#include "rendering/blur/blurparameters.h"

#include <QPointer>
#include <QSGTextureProvider>

#include <memory>

class BlurEffectCache;
class BlurEffectTextureProvider;

// Keeps a blurred copy of a source texture current (render thread): update() blurs the
// source again when it has new content or the blur changed, and offers the result through
// a provider. A layer as the source is brought up to date first, so it renders on demand.
class BlurEffectPass
{
public:
    explicit BlurEffectPass(BlurEffectCache *cache);
    ~BlurEffectPass();

    void setSource(QSGTextureProvider *source);
    void setParameters(const BlurParameters &parameters);
    void setProvider(BlurEffectTextureProvider *provider);
    void releaseTargets();

    // Call before the frame is rendered (a node's preprocess). Returns the blurred copy,
    // or null without a source or while blurring is off or failed.
    QSGTexture *update();
    QSGTexture *source() const { return m_lastSource; }
    QSGTexture *blurred() const { return m_result; }

private:
    BlurEffectCache *m_cache;
    QPointer<QSGTextureProvider> m_source;
    QMetaObject::Connection m_sourceChanged;
    QPointer<BlurEffectTextureProvider> m_provider;
    QSGTexture *m_lastSource = nullptr;
    QSGTexture *m_result = nullptr;
    BlurParameters m_parameters;
    bool m_dirty = true;
    std::unique_ptr<BlurEffectTexture> m_blurred;
};
