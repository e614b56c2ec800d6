#pragma once

#include <QImage>
#include <QQuickTextureFactory>
#include <QSize>
#include <QString>

// Decodes an image file (on the image loader thread, when its size is first asked for)
// and turns it into a texture. When QSG_TRANSIENT_IMAGES is set, the decoded pixels are
// let go once the texture exists: a large one-off image then costs no CPU memory, at
// the price of decoding again should the texture have to be made anew.
class TransientImageTextureFactory : public QQuickTextureFactory
{
    Q_OBJECT

public:
    TransientImageTextureFactory(const QString &path, const QSize &requestedSize);

    QSGTexture *createTexture(QQuickWindow *window) const override;
    QSize textureSize() const override;
    int textureByteCount() const override { return int(m_image.sizeInBytes()); }
    QImage image() const override { return m_image; }

    QString path() const { return m_path; }
    // Whether decoded pixels are dropped once their texture exists (read once).
    static bool dropsDecodedImages();

private:
    void decode() const;

    QString m_path;
    QSize m_requestedSize;
    mutable QImage m_image;
    mutable QSize m_size;
    mutable bool m_decoded = false;
};
