#include "blureffecttextureprovider.h"

void BlurEffectTextureProvider::setTexture(QSGTexture *texture)
{
    m_texture = texture;
    Q_EMIT textureChanged();
}
