#pragma once

#include "core/themeiconresolver.h"
#include "rendering/themeimages/themeimagerecord.h"

#include <QImage>
#include <QQuickTextureFactory>

// Carries a decoded theme image from the image loader to the render thread, where it
// becomes an atlas or standalone texture of the window; it then lets go of the pixels.
class ThemeTextureFactory : public QQuickTextureFactory
{
    Q_OBJECT

public:
    ThemeTextureFactory(const Pelkan::ThemeIconResolver &resolver, const ThemeImageRecord &record, const QString &path,
                        const QImage &bordered, quint32 generation);

    QSGTexture *createTexture(QQuickWindow *window) const override;
    QSize textureSize() const override;
    int textureByteCount() const override { return int(m_image.sizeInBytes()); }
    QImage image() const override;

private:
    Pelkan::ThemeIconResolver m_resolver;
    ThemeImageRecord m_record;
    mutable QString m_path;
    mutable QImage m_image;
    quint32 m_generation;
};
