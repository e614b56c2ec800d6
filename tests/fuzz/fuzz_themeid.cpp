// Theme image ids as applications write them: a name, a path or a URL, and a colour
// after '?', resolved against a theme folder and tinted.
#include "fuzzinput.h"
#include "themeiconresolver.h"
#include "rendering/themeimages/themeimagedecoder.h"
#include "rendering/themeimages/themepixels.h"

#include <QGuiApplication>
#include <QImage>
#include <QTemporaryDir>

namespace {
QTemporaryDir *s_theme = nullptr;
QImage *s_icon = nullptr;
}

extern "C" int LLVMFuzzerInitialize(int *argc, char ***argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    new QGuiApplication(*argc, *argv);
    s_theme = new QTemporaryDir;
    QDir(s_theme->path()).mkpath(QStringLiteral("icons/z1.0"));
    s_icon = new QImage(8, 8, QImage::Format_ARGB32);
    s_icon->fill(Qt::gray);
    s_icon->save(s_theme->filePath(QStringLiteral("icons/icon-m-a.png")));
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    FuzzInput in(data, size);
    const QString id = in.rest();
    ThemeImageRecord record = ThemeImageDecoder::parseId(id);
    const Pelkan::ThemeIconResolver resolver(s_theme->path(), 1.0);
    const QString path = resolver.resolvePath(record.name);
    // A name without a path never leaves the theme folder.
    if (!path.isEmpty() && !record.name.startsWith(QLatin1Char('/')) && !record.name.startsWith(QLatin1String("file:"))
            && !path.startsWith(s_theme->path()))
        __builtin_trap();
    ThemePixels::render(*s_icon, record.color, true);
    return 0;
}
