#pragma once

#include "rendering/blur/blureffectpass.h"

#include <QSGNode>

// An OverlayBackgroundSource in the scene graph: draws nothing, but blurs the capture
// before each frame in which it changed.
class OverlayBackgroundSourceNode : public QSGNode
{
public:
    explicit OverlayBackgroundSourceNode(BlurEffectCache *cache)
        : m_pass(cache)
    {
        setFlag(UsePreprocess);
    }

    BlurEffectPass &pass() { return m_pass; }
    void preprocess() override { m_pass.update(); }

private:
    BlurEffectPass m_pass;
};
