#pragma once

#include <QColor>
#include <QSGMaterial>

// Draws a blur effect: its source mixed with the blurred copy, tinted by the overlay.
// Each item has its own (the blurred copy is its own texture).
class BlurEffectMaterial : public QSGMaterial
{
public:
    BlurEffectMaterial();

    QSGMaterialType *type() const override;
    QSGMaterialShader *createShader() const override;
    int compare(const QSGMaterial *other) const override;

    QSGTexture *source = nullptr; // not owned
    QSGTexture *blur = nullptr;   // not owned
    QColor overlayColor = Qt::transparent;
    float blurAlpha = 1.0f;
};
