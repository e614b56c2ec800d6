#pragma once

#include "core/themeiconresolver.h"

#include <QMutex>
#include <QQuickImageProvider>

#include <memory>

class QQuickWindow;
class ThemeTextureAtlas;

// The "theme" image provider: "image://theme/icon-m-back" or, tinted,
// "image://theme/icon-m-back?#ff8800". Small images of a window share one texture atlas
// so the scene graph can draw them in one batch; images marked Grayscale follow the
// theme's primary colour, re-tinted on the GPU side without QML reloading anything.
//
// Qt's pixmap cache is shared by every engine of the process and keeps texture factories
// beyond the engine (and provider) that made them, so factories and atlases depend on no
// provider: they carry their own copy of the icon resolver, and the atlases are kept
// process-wide.
class DeclarativeImageProvider : public QQuickImageProvider
{
public:
    DeclarativeImageProvider();
    ~DeclarativeImageProvider() override;

    QQuickTextureFactory *requestTexture(const QString &id, QSize *size, const QSize &requestedSize) override;

    // The atlas of the context the window renders with, made on first use (render thread,
    // the context current).
    static ThemeTextureAtlas *atlasFor(QQuickWindow *window, const Pelkan::ThemeIconResolver &resolver);
    // Atlases there are now (one per GL context that drew a theme image).
    static int atlasCount();
    // The theme folder and pixel ratio new requests resolve against (any thread).
    Pelkan::ThemeIconResolver resolver() const;

    // Bumped on every change of the theme's primary colour.
    static quint32 colorGeneration();

private:
    static void reportMissing(const QString &name, const Pelkan::ThemeIconResolver &resolver);

    mutable QMutex m_resolverMutex;
    Pelkan::ThemeIconResolver m_resolver;
    std::unique_ptr<QObject> m_context; // ends the theme connections with the provider
};
