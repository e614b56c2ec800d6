#include "quorvanepelkanplugin.h"
#include "plugin/moduleregistration.h"
#include "plugin/translator.h"

#include "core/coreregistration.h"
#include "rendering/providers/backgroundimageprovider.h"
#include "rendering/themeimages/declarativeimageprovider.h"
#include "core/screen.h"
#include "text/declarativeformatter.h"
#include "services/timezoneupdater.h"
#include "rendering/providers/transientimageprovider.h"

#include <QCoreApplication>
#include <QLocale>
#include <QQmlContext>
#include <QQmlEngine>

#include <cstring>

namespace {

const char PublicUri[] = "Quorvane.Pelkan";
const char PrivateUri[] = "Quorvane.Pelkan.private";
const char ThemeUri[] = "Quorvane.Pelkan.theme";

// Length first, then the bytes: a URI that merely starts with a module's name is not it.
template <size_t N>
bool isUri(const char *uri, size_t length, const char (&name)[N])
{
    return length == N - 1 && std::memcmp(uri, name, N - 1) == 0;
}

const QString TranslationsDirectory = QStringLiteral("/usr/share/translations");

} // namespace

void QuorvanePelkanPlugin::registerTypes(const char *uri)
{
    if (!uri)
        return;
    const size_t length = std::strlen(uri);
    if (isUri(uri, length, PublicUri))
        ModuleRegistration::registerPublicModule(uri);
    else if (isUri(uri, length, PrivateUri))
        ModuleRegistration::registerPrivateModule(uri);
    else if (isUri(uri, length, ThemeUri))
        ModuleRegistration::registerThemeModule(uri);
}

void QuorvanePelkanPlugin::initializeEngine(QQmlEngine *engine, const char *uri)
{
    if (!uri || !isUri(uri, std::strlen(uri), PublicUri))
        return;

    Pelkan::Private::initializeEngine(engine, uri);
    if (!engine->imageProvider(QStringLiteral("theme")))
        engine->addImageProvider(QStringLiteral("theme"), new DeclarativeImageProvider);
    if (!engine->imageProvider(QStringLiteral("transientimage")))
        engine->addImageProvider(QStringLiteral("transientimage"), new TransientImageProvider);
    engine->addImageProvider(QStringLiteral("pelkan-background"), new BackgroundImageProvider);

    QQmlContext *context = engine->rootContext();
    context->setContextProperty(QStringLiteral("screen"), Pelkan::Screen::instance());
    context->setContextProperty(QStringLiteral("_defaultLabelFormat"), QVariant(0)); // Qt::PlainText

    // The localised catalogue is installed last so that it is consulted first; the
    // engineering-English one answers for ids it lacks.
    auto fallback = new Translator(engine);
    QCoreApplication::installTranslator(fallback);
    (void)fallback->load(QStringLiteral("quorvanepelkan-qt5_eng_en"), TranslationsDirectory);

    auto localised = new Translator(engine);
    QCoreApplication::installTranslator(localised);
    (void)localised->load(QLocale(), QStringLiteral("quorvanepelkan-qt5"), QStringLiteral("-"),
                          TranslationsDirectory);

    auto *zone = new TimeZoneUpdater(engine);
    QObject::connect(zone, &TimeZoneUpdater::timeZoneChanged, &DeclarativeFormatter::notifyTimeZoneChanged);
}
