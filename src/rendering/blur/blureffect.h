#pragma once

#include <QColor>
#include <QPointer>
#include <QQuickItem>

#include "rendering/common/sourcelayer.h"

class BlurEffectTextureProvider;

// Draws a blurred copy of another item (sourceItem), optionally mixed with the sharp
// source (intensity: 1 is all blur, 0 none) and tinted by overlayColor. The blur is a
// Gaussian of the given kernel and deviation, run over `levels` levels, each half the
// size of the one before, with `iterations` rounds on the last level (or on every level
// with IterateAllLayers). A source item that is not a texture provider gets its layer
// enabled for as long as it is the source. The blurred copy is offered to other items as
// this item's texture.
class BlurEffect : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(bool blur READ blur WRITE setBlur RESET resetBlur NOTIFY blurChanged)
    Q_PROPERTY(QQuickItem *sourceItem READ sourceItem WRITE setSourceItem NOTIFY sourceItemChanged)
    Q_PROPERTY(Kernel kernel READ kernel WRITE setKernel NOTIFY kernelChanged)
    Q_PROPERTY(int levels READ levels WRITE setLevels NOTIFY levelsChanged)
    Q_PROPERTY(int iterations READ iterations WRITE setIterations NOTIFY iterationsChanged)
    Q_PROPERTY(IterationBehavior iterationBehavior READ iterationBehavior WRITE setIterationBehavior NOTIFY iterationBehaviorChanged)
    Q_PROPERTY(float deviation READ deviation WRITE setDeviation RESET resetDeviation NOTIFY deviationChanged)
    Q_PROPERTY(float intensity READ intensity WRITE setIntensity NOTIFY intensityChanged)
    Q_PROPERTY(QColor overlayColor READ overlayColor WRITE setOverlayColor NOTIFY overlayColorChanged)

public:
    enum Kernel { Gaussian5, Gaussian9, Gaussian13, Gaussian17, Gaussian21, Gaussian25, Gaussian29, Gaussian33 };
    Q_ENUM(Kernel)
    enum IterationBehavior { IterateAllLayers, IterateLastLayer };
    Q_ENUM(IterationBehavior)

    explicit BlurEffect(QQuickItem *parent = nullptr);
    ~BlurEffect() override;

    // Follows the item's visibility until written.
    bool blur() const { return m_blur; }
    void setBlur(bool blur);
    void resetBlur();
    QQuickItem *sourceItem() const { return m_sourceItem; }
    void setSourceItem(QQuickItem *item);
    Kernel kernel() const { return m_kernel; }
    void setKernel(int kernel);   // clamped to the kernels there are
    int levels() const { return m_levels; }
    void setLevels(int levels);   // 1 to 5
    int iterations() const { return m_iterations; }
    void setIterations(int iterations); // at least 1
    IterationBehavior iterationBehavior() const { return m_iterationBehavior; }
    void setIterationBehavior(IterationBehavior behavior);
    // 1.5 until written, or until the kernel changes or it is reset: then the kernel's own.
    float deviation() const { return m_deviation; }
    void setDeviation(float deviation);
    void resetDeviation();
    float intensity() const { return m_intensity; }
    void setIntensity(float intensity);
    QColor overlayColor() const { return m_overlayColor; }
    void setOverlayColor(const QColor &color);

    bool isTextureProvider() const override { return true; }
    QSGTextureProvider *textureProvider() const override;

    // Lets go of the offscreen textures; the next frame makes them anew.
    Q_INVOKABLE void invalidateSceneGraph();

Q_SIGNALS:
    void blurChanged();
    void sourceItemChanged();
    void kernelChanged();
    void levelsChanged();
    void iterationsChanged();
    void iterationBehaviorChanged();
    void deviationChanged();
    void intensityChanged();
    void overlayColorChanged();

protected:
    QSGNode *updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *) override;
    void releaseResources() override;
    void itemChange(ItemChange change, const ItemChangeData &data) override;

private:
    template <typename T, typename Signal>
    void assign(T &field, const T &value, Signal signal);
    void storeDeviation(float deviation);
    void sourceDestroyed();

    bool m_blur = true;
    bool m_blurExplicit = false;
    QPointer<QQuickItem> m_sourceItem;
    SourceLayer m_layer;
    Kernel m_kernel = Gaussian9;
    int m_levels = 3;
    int m_iterations = 1;
    IterationBehavior m_iterationBehavior = IterateLastLayer;
    float m_deviation = 1.5f;
    bool m_deviationExplicit = false;
    float m_intensity = 1.0f;
    QColor m_overlayColor = Qt::transparent;
    bool m_invalidate = false;
    mutable BlurEffectTextureProvider *m_provider = nullptr; // render thread
};
