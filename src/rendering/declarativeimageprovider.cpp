#include "declarativeimageprovider.h"
#include "theme.h"
#include "themeimagedecoder.h"
#include "themetextureatlas.h"
#include "themetexturefactory.h"

#include <QHash>
#include <QMutex>
#include <QOpenGLContext>
#include <QOpenGLFunctions>
#include <QQuickWindow>

#include <atomic>

namespace {

std::atomic<quint32> s_colorGeneration { 0 };

struct AtlasTable {
    QMutex mutex;
    QHash<QQuickWindow *, ThemeTextureAtlas *> atlases;
};
Q_GLOBAL_STATIC(AtlasTable, s_table)

} // namespace

DeclarativeImageProvider::DeclarativeImageProvider()
    : QQuickImageProvider(QQuickImageProvider::Texture)
{
    QObject::connect(Pelkan::Theme::instance(), &Pelkan::Theme::primaryColorChanged, Pelkan::Theme::instance(),
                     [] { ++s_colorGeneration; });
}

DeclarativeImageProvider::~DeclarativeImageProvider() = default;

quint32 DeclarativeImageProvider::colorGeneration()
{
    return s_colorGeneration.load();
}

QQuickTextureFactory *DeclarativeImageProvider::requestTexture(const QString &id, QSize *size, const QSize &requestedSize)
{
    ThemeImageRecord record = ThemeImageDecoder::parseId(id);
    const QString path = m_resolver.resolvePath(record.name);
    const QImage image = ThemeImageDecoder::decode(path, record, requestedSize);
    if (image.isNull())
        return nullptr;
    if (size)
        *size = image.size();
    return new ThemeTextureFactory(m_resolver, record, path, image, colorGeneration());
}

ThemeTextureAtlas *DeclarativeImageProvider::atlasFor(QQuickWindow *window, const Pelkan::ThemeIconResolver &resolver)
{
    if (!window)
        return nullptr;
    QMutexLocker locker(&s_table->mutex);
    if (ThemeTextureAtlas *atlas = s_table->atlases.value(window))
        return atlas;

    int maximum = 4096;
    if (QOpenGLContext *context = QOpenGLContext::currentContext())
        context->functions()->glGetIntegerv(GL_MAX_TEXTURE_SIZE, &maximum);
    const int side = ThemeTextureAtlas::sideFor(window->size(), maximum);
    auto atlas = new ThemeTextureAtlas(resolver, side);
    s_table->atlases.insert(window, atlas);

    // Runs on the GUI thread: only an atomic flag and an update request.
    QObject::connect(Pelkan::Theme::instance(), &Pelkan::Theme::primaryColorChanged, atlas, [atlas, window] {
        atlas->themeChanged();
        window->update();
    }, Qt::DirectConnection);
    QObject::connect(window, &QQuickWindow::sceneGraphInvalidated, atlas, [window] {
        QMutexLocker locker(&s_table->mutex);
        delete s_table->atlases.take(window);
    }, Qt::DirectConnection);
    return atlas;
}
