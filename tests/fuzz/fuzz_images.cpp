// Image files of any content through the three image providers, with any size asked for.
#include "rendering/providers/backgroundimageprovider.h"
#include "boundedimagereader.h"
#include "rendering/themeimages/declarativeimageprovider.h"
#include "fuzzinput.h"
#include "rendering/providers/transientimageprovider.h"

#include <QGuiApplication>
#include <QTemporaryDir>

namespace {
QTemporaryDir *s_dir = nullptr;
QQuickImageProvider *s_providers[3] = {};
const char *const Suffixes[] = { "png", "jpg", "svg", "gif", "bmp", "ppm", "xpm", "ico" };
}

extern "C" int LLVMFuzzerInitialize(int *argc, char ***argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    qputenv("XDG_CACHE_HOME", QByteArray(QDir::tempPath().toUtf8() + "/pelkan-fuzz-cache"));
    new QGuiApplication(*argc, *argv);
    s_dir = new QTemporaryDir;
    s_providers[0] = new DeclarativeImageProvider;
    s_providers[1] = new TransientImageProvider;
    s_providers[2] = new BackgroundImageProvider;
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    FuzzInput in(data, size);
    const uint8_t choice = in.take<uint8_t>();
    const QSize requested(in.take<int16_t>(), in.take<int16_t>());
    const QString path = s_dir->filePath(QStringLiteral("image.") + QLatin1String(Suffixes[choice % 8]));
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Truncate))
        return 0;
    file.write(in.restBytes());
    file.close();

    QQuickImageProvider *provider = s_providers[(choice >> 3) % 3];
    QSize made;
    if (provider->imageType() == QQuickImageProvider::Texture) {
        std::unique_ptr<QQuickTextureFactory> factory(provider->requestTexture(path, &made, requested));
        if (factory)
            made = factory->textureSize();
    } else {
        made = provider->requestImage(path, &made, requested).size();
    }
    // Nothing larger than the limits is ever made (the theme's texture has a border).
    if (made.isValid() && !BoundedImageReader::fits(made - QSize(2, 2)))
        __builtin_trap();
    return 0;
}
