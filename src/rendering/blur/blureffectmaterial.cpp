#include "blureffectmaterial.h"
#include "rendering/blur/blureffectshader.h"

BlurEffectMaterial::BlurEffectMaterial()
{
    setFlag(Blending);
}

QSGMaterialType *BlurEffectMaterial::type() const
{
    static QSGMaterialType type;
    return &type;
}

QSGMaterialShader *BlurEffectMaterial::createShader() const
{
    return new BlurEffectShader;
}

int BlurEffectMaterial::compare(const QSGMaterial *other) const
{
    return this == other ? 0 : (this < other ? -1 : 1);
}
