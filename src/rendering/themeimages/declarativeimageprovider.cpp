#include "declarativeimageprovider.h"
#include "core/pelkanlogging.h"
#include "core/theme.h"
#include "rendering/themeimages/themeimagedecoder.h"
#include "rendering/themeimages/themetextureatlas.h"
#include "rendering/themeimages/themetexturefactory.h"
#include "rendering/common/renderresourcerelease.h"

#include <QGuiApplication>
#include <QHash>
#include <QMutex>
#include <QOpenGLContext>
#include <QOpenGLFunctions>
#include <QSet>
#include <QQuickWindow>

#include <atomic>

namespace {

std::atomic<quint32> s_colorGeneration { 0 };

struct AtlasTable {
    QMutex mutex;
    QHash<QOpenGLContext *, ThemeTextureAtlas *> atlases;
};
Q_GLOBAL_STATIC(AtlasTable, s_table)

} // namespace

DeclarativeImageProvider::DeclarativeImageProvider()
    : QQuickImageProvider(QQuickImageProvider::Texture)
{
    Pelkan::Theme *theme = Pelkan::Theme::instance();
    QObject::connect(theme, &Pelkan::Theme::primaryColorChanged, theme, [] { ++s_colorGeneration; });
    // New requests look in the folder and at the ratio of the moment; images already
    // shown keep what they have until they are loaded again. (GUI thread; requests read
    // the resolver under the mutex from loader threads.)
    m_context.reset(new QObject);
    auto follow = [this] {
        const Pelkan::ThemeIconResolver resolver;
        QMutexLocker locker(&m_resolverMutex);
        m_resolver = resolver;
    };
    QObject::connect(theme, &Pelkan::Theme::themeDirectoryChanged, m_context.get(), follow);
    QObject::connect(theme, &Pelkan::Theme::pixelRatioChanged, m_context.get(), follow);
}

DeclarativeImageProvider::~DeclarativeImageProvider() = default;

quint32 DeclarativeImageProvider::colorGeneration()
{
    return s_colorGeneration.load();
}

Pelkan::ThemeIconResolver DeclarativeImageProvider::resolver() const
{
    QMutexLocker locker(&m_resolverMutex);
    return m_resolver;
}

QQuickTextureFactory *DeclarativeImageProvider::requestTexture(const QString &id, QSize *size, const QSize &requestedSize)
{
    ThemeImageRecord record = ThemeImageDecoder::parseId(id);
    const Pelkan::ThemeIconResolver resolver = this->resolver();
    const QString path = resolver.resolvePath(record.name);
    if (path.isEmpty()) {
        reportMissing(record.name, resolver);
        return nullptr;
    }
    const QImage image = ThemeImageDecoder::decode(path, record, requestedSize);
    if (image.isNull())
        return nullptr;
    if (size)
        *size = image.size();
    return new ThemeTextureFactory(resolver, record, path, image, colorGeneration());
}

void DeclarativeImageProvider::reportMissing(const QString &name, const Pelkan::ThemeIconResolver &resolver)
{
    // Once per name and theme: a list of a hundred rows asking for the same missing icon
    // says so once.
    static QMutex mutex;
    static QSet<QString> reported;
    const QString key = resolver.themeDirectory() + QLatin1Char('\n') + QString::number(resolver.pixelRatio())
            + QLatin1Char('\n') + name;
    {
        QMutexLocker locker(&mutex);
        if (reported.contains(key))
            return;
        reported.insert(key);
    }
    const QString ratio = Pelkan::ThemeIconResolver::ratioFolder(resolver.pixelRatio());
    const QString directory = resolver.themeDirectory();
    qCWarning(lcPelkanCoreLog).noquote().nospace()
            << "Theme image \"" << name << "\" not found in " << directory << "/icons/" << ratio << ", "
            << directory << "/icons, " << directory << "/graphics/" << ratio << " or " << directory << "/graphics";
}

int DeclarativeImageProvider::atlasCount()
{
    QMutexLocker locker(&s_table->mutex);
    return s_table->atlases.size();
}

ThemeTextureAtlas *DeclarativeImageProvider::atlasFor(QQuickWindow *window, const Pelkan::ThemeIconResolver &resolver)
{
    QOpenGLContext *context = QOpenGLContext::currentContext();
    if (!window || !context)
        return nullptr;
    // One atlas per context, not per window: the basic loop renders every window with
    // one context and hands a texture made for one window to the others.
    QMutexLocker locker(&s_table->mutex);
    if (ThemeTextureAtlas *atlas = s_table->atlases.value(context))
        return atlas;

    int maximum = 4096;
    context->functions()->glGetIntegerv(GL_MAX_TEXTURE_SIZE, &maximum);
    const int side = ThemeTextureAtlas::sideFor(window->size(), maximum);
    auto atlas = new ThemeTextureAtlas(resolver, side);
    s_table->atlases.insert(context, atlas);

    // Runs on the GUI thread: only an atomic flag and update requests, for the windows
    // there are now (which of them show the atlas is not known here).
    QObject::connect(Pelkan::Theme::instance(), &Pelkan::Theme::primaryColorChanged, atlas, [atlas] {
        atlas->themeChanged();
        const QWindowList windows = QGuiApplication::topLevelWindows();
        for (QWindow *shown : windows) {
            if (auto quickWindow = qobject_cast<QQuickWindow *>(shown))
                quickWindow->update();
        }
    }, Qt::DirectConnection);
    RenderResourceRelease::watch(window, atlas, [context, atlas] {
        QMutexLocker locker(&s_table->mutex);
        if (s_table->atlases.value(context) == atlas)
            s_table->atlases.remove(context);
        delete atlas;
    });
    return atlas;
}
