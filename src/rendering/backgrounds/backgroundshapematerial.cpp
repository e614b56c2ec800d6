#include "backgroundshapematerial.h"
#include "rendering/backgrounds/backgroundshapeshader.h"

BackgroundShapeMaterial::BackgroundShapeMaterial()
{
    setFlag(Blending);
}

QSGMaterialType *BackgroundShapeMaterial::type() const
{
    static QSGMaterialType types[2];
    return &types[m_tailed ? 1 : 0];
}

QSGMaterialShader *BackgroundShapeMaterial::createShader() const
{
    return new BackgroundShapeShader(m_tailed);
}

int BackgroundShapeMaterial::compare(const QSGMaterial *other) const
{
    auto o = static_cast<const BackgroundShapeMaterial *>(other);
    const auto order = [](auto a, auto b) { return a == b ? 0 : (a < b ? -1 : 1); };
    if (int c = order(color.rgba(), o->color.rgba()))
        return c;
    if (int c = order(borderColor.rgba(), o->borderColor.rgba()))
        return c;
    if (int c = order(quintptr(pattern), quintptr(o->pattern)))
        return c;
    if (int c = order(patternOpacity, o->patternOpacity))
        return c;
    return order(quintptr(backdrop.data()), quintptr(o->backdrop.data()));
}
