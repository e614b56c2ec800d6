#pragma once

#include "themeiconresolver.h"

#include <QQuickImageProvider>

class QQuickWindow;
class ThemeTextureAtlas;

// The "theme" image provider: "image://theme/icon-m-back" or, tinted,
// "image://theme/icon-m-back?#ff8800". Small images of a window share one texture atlas
// so the scene graph can draw them in one batch; images marked Grayscale follow the
// theme's primary colour, re-tinted on the GPU side without QML reloading anything.
//
// Qt's pixmap cache is shared by every engine of the process and keeps texture factories
// beyond the engine (and provider) that made them, so factories and atlases depend on no
// provider: they carry their own copy of the icon resolver, and the window atlases are
// kept process-wide.
class DeclarativeImageProvider : public QQuickImageProvider
{
public:
    DeclarativeImageProvider();
    ~DeclarativeImageProvider() override;

    QQuickTextureFactory *requestTexture(const QString &id, QSize *size, const QSize &requestedSize) override;

    // The window's atlas, made on first use (render thread).
    static ThemeTextureAtlas *atlasFor(QQuickWindow *window, const Pelkan::ThemeIconResolver &resolver);
    const Pelkan::ThemeIconResolver &resolver() const { return m_resolver; }

    // Bumped on every change of the theme's primary colour.
    static quint32 colorGeneration();

private:
    Pelkan::ThemeIconResolver m_resolver;
};
