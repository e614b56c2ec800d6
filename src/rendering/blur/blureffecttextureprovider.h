#pragma once

#include <QPointer>
#include <QSGTexture>
#include <QSGTextureProvider>

// Offers a blur effect's blurred copy to other items (render thread).
class BlurEffectTextureProvider : public QSGTextureProvider
{
    Q_OBJECT

public:
    QSGTexture *texture() const override { return m_texture; }
    void setTexture(QSGTexture *texture);

private:
    QPointer<QSGTexture> m_texture;
};
