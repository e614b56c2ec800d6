#include "theme.h"
#include "configvalue.h"
#include "mgconfitem.h"
#include "pelkanlogging.h"
#include "screen.h"

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QHash>
#include <QPointer>
#include <QtMath>

#include <dlfcn.h>

namespace Pelkan {

namespace {

const char *const ColorKeys[Theme::ColorRoleCount] = {
    "primary_color",
    "secondary_color",
    "highlight_color",
    "secondary_highlight_color",
    "highlight_background_color",
    "overlay_background_color",
    "error_color",
    "background_color",
};

// Opacity of the secondary colours when they are derived from the primary ones.
const qreal SecondaryOpacity = 0.6;

QColor withAlpha(QColor color, qreal alpha)
{
    color.setAlphaF(alpha);
    return color;
}

} // namespace

class Theme::Configuration : public QObject
{
public:
    static Configuration *instance();
    ~Configuration() override;

    const State &state() const { return m_state; }
    void attach(Theme *theme) { m_themes.append(theme); }
    void detach(Theme *theme) { m_themes.removeOne(theme); }

private:
    Configuration();
    void reload();
    State readState() const;
    qreal readPixelRatio() const;
    ColorScheme readScheme() const;
    QColor readColor(ColorRole role, const QColor &fallback) const;
    QString readDirectory() const;
    // Whether a refused value of item is new, so worth a warning; forgetRefusal() when the
    // key holds a good value again.
    bool isNewRefusal(const MGConfItem *item, const QVariant &value) const;
    void forgetRefusal(const MGConfItem *item) const;

    QVector<MGConfItem *> m_colorConfig;
    MGConfItem *m_pixelRatioConfig;
    MGConfItem *m_schemeConfig;
    MGConfItem *m_directoryConfig;
    State m_state;
    QVector<Theme *> m_themes;
    mutable QHash<QString, QVariant> m_refused; // key -> the value last warned about
};

Theme::Configuration *Theme::Configuration::instance()
{
    // Lives with the application; made again should another come.
    static QPointer<Configuration> s_configuration;
    if (!s_configuration)
        s_configuration = new Configuration;
    return s_configuration;
}

Theme::Configuration::Configuration()
    : QObject(QCoreApplication::instance())
{
    auto watch = [this](const char *name) {
        auto item = new MGConfItem(configurationPath() + QLatin1String(name), this);
        connect(item, &MGConfItem::valueChanged, this, &Configuration::reload);
        return item;
    };
    m_pixelRatioConfig = watch("pixel_ratio");
    m_schemeConfig = watch("color_scheme");
    m_directoryConfig = watch("directory");
    for (const char *key : ColorKeys)
        m_colorConfig.append(watch(key));

    connect(Screen::instance(), &Screen::geometryChanged, this, &Configuration::reload);
    m_state = readState();
}

Theme::Configuration::~Configuration()
{
    // Themes that outlive it keep the values they last had.
    for (Theme *theme : qAsConst(m_themes)) {
        theme->m_detached = m_state;
        theme->m_state = &theme->m_detached;
    }
}

void Theme::Configuration::reload()
{
    const State old = m_state;
    m_state = readState();
    // Every theme holds the new values before the first one announces them.
    const QVector<Theme *> themes = m_themes;
    for (Theme *theme : themes)
        theme->announce(old);
}

Theme *Theme::instance()
{
    static QPointer<Theme> s_instance;
    if (!s_instance)
        s_instance = new Theme(QCoreApplication::instance());
    return s_instance;
}

Theme::Theme(QObject *parent)
    : QObject(parent)
{
    Configuration *configuration = Configuration::instance();
    configuration->attach(this);
    m_state = &configuration->state();
}

Theme::~Theme()
{
    if (m_state != &m_detached)
        Configuration::instance()->detach(this);
}

QString Theme::configurationPath()
{
    return QStringLiteral("/desktop/quorvane/pelkan/theme/");
}

void (Theme::*Theme::colorSignal(ColorRole role))()
{
    static void (Theme::*const notifiers[ColorRoleCount])() = {
        &Theme::primaryColorChanged,
        &Theme::secondaryColorChanged,
        &Theme::highlightColorChanged,
        &Theme::secondaryHighlightColorChanged,
        &Theme::highlightBackgroundColorChanged,
        &Theme::overlayBackgroundColorChanged,
        &Theme::errorColorChanged,
        &Theme::backgroundColorChanged,
    };
    return notifiers[role];
}

QSize Theme::scaledSize(int width, int height) const
{
    return QSize(qRound(width * m_state->pixelRatio), qRound(height * m_state->pixelRatio));
}

QColor Theme::rgba(const QColor &color, qreal opacity) const
{
    return withAlpha(color, qBound<qreal>(0.0, opacity, 1.0));
}

QString Theme::highlightText(const QString &text, const QString &pattern, const QColor &color) const
{
    if (pattern.isEmpty())
        return text.toHtmlEscaped();

    const QString open = QStringLiteral("<font color=\"%1\">").arg(color.name(QColor::HexArgb));
    QString result;
    int from = 0;
    for (int at = text.indexOf(pattern, 0, Qt::CaseInsensitive); at >= 0;
         at = text.indexOf(pattern, from, Qt::CaseInsensitive)) {
        result += text.mid(from, at - from).toHtmlEscaped();
        result += open + text.mid(at, pattern.size()).toHtmlEscaped() + QLatin1String("</font>");
        from = at + pattern.size();
    }
    result += text.mid(from).toHtmlEscaped();
    return result;
}

void Theme::announce(const State &old)
{
    const State &now = *m_state;
    if (!qFuzzyCompare(old.pixelRatio, now.pixelRatio))
        Q_EMIT pixelRatioChanged();
    if (old.scheme != now.scheme)
        Q_EMIT colorSchemeChanged();
    for (int role = 0; role < ColorRoleCount; ++role) {
        if (old.colors.at(role) != now.colors.at(role))
            Q_EMIT (this->*colorSignal(ColorRole(role)))();
    }
    if (old.directory != now.directory)
        Q_EMIT themeDirectoryChanged();
}

Theme::State Theme::Configuration::readState() const
{
    State state;
    state.pixelRatio = readPixelRatio();
    state.scheme = readScheme();
    state.directory = readDirectory();

    const bool dark = state.scheme == DarkOnLight;
    QVector<QColor> &c = state.colors;
    c[PrimaryColor] = readColor(PrimaryColor, dark ? QColor(0x00, 0x00, 0x00) : QColor(0xff, 0xff, 0xff));
    c[HighlightColor] = readColor(HighlightColor, dark ? QColor(0x00, 0x66, 0xb3) : QColor(0x4d, 0xb8, 0xff));
    c[SecondaryColor] = readColor(SecondaryColor, withAlpha(c[PrimaryColor], SecondaryOpacity));
    c[SecondaryHighlightColor] = readColor(SecondaryHighlightColor, withAlpha(c[HighlightColor], SecondaryOpacity));
    c[HighlightBackgroundColor] = readColor(HighlightBackgroundColor, c[HighlightColor]);
    c[OverlayBackgroundColor] = readColor(OverlayBackgroundColor, dark ? QColor(0xff, 0xff, 0xff) : QColor(0x00, 0x00, 0x00));
    c[ErrorColor] = readColor(ErrorColor, dark ? QColor(0xc6, 0x28, 0x28) : QColor(0xff, 0x4d, 0x4d));
    c[BackgroundColor] = readColor(BackgroundColor, dark ? QColor(0xf4, 0xf6, 0xfa) : QColor(0x10, 0x14, 0x1c));
    return state;
}

bool Theme::Configuration::isNewRefusal(const MGConfItem *item, const QVariant &value) const
{
    auto known = m_refused.constFind(item->key());
    if (known != m_refused.constEnd() && *known == value && known->userType() == value.userType())
        return false;
    m_refused.insert(item->key(), value);
    return true;
}

void Theme::Configuration::forgetRefusal(const MGConfItem *item) const
{
    m_refused.remove(item->key());
}

qreal Theme::Configuration::readPixelRatio() const
{
    const QVariant configured = m_pixelRatioConfig->value();
    if (configured.isValid()) {
        qreal ratio = 0;
        if (ConfigValue::toReal(configured, &ratio) && ratio >= MinPixelRatio && ratio <= MaxPixelRatio) {
            forgetRefusal(m_pixelRatioConfig);
            return ratio;
        }
        if (isNewRefusal(m_pixelRatioConfig, configured))
            qCWarning(lcPelkanThemeLog) << "Theme: ignoring invalid pixel ratio" << configured;
    }
    // Quarter steps keep metrics on whole pixels for the common display widths.
    return qMax<qreal>(1.0, qRound(Screen::instance()->widthRatio() * 4) / 4.0);
}

Theme::ColorScheme Theme::Configuration::readScheme() const
{
    const QVariant configured = m_schemeConfig->value();
    if (!configured.isValid())
        return LightOnDark;
    QString name;
    if (ConfigValue::toString(configured, &name)) {
        name = name.toLower();
        if (name == QLatin1String("lightondark") || name == QLatin1String("darkonlight")) {
            forgetRefusal(m_schemeConfig);
            return name == QLatin1String("darkonlight") ? DarkOnLight : LightOnDark;
        }
    }
    if (isNewRefusal(m_schemeConfig, configured))
        qCWarning(lcPelkanThemeLog) << "Theme: ignoring invalid colour scheme" << configured;
    return LightOnDark;
}

QColor Theme::Configuration::readColor(ColorRole role, const QColor &fallback) const
{
    const MGConfItem *item = m_colorConfig.at(role);
    const QVariant configured = item->value();
    if (!configured.isValid())
        return fallback;
    QString name;
    const QColor color = ConfigValue::toString(configured, &name) ? QColor(name) : QColor();
    if (color.isValid()) {
        forgetRefusal(item);
        return color;
    }
    if (isNewRefusal(item, configured))
        qCWarning(lcPelkanThemeLog) << "Theme: ignoring invalid colour" << configured << "in" << item->key();
    return fallback;
}

QString Theme::Configuration::readDirectory() const
{
    const QVariant configured = m_directoryConfig->value();
    if (!configured.isValid())
        return defaultThemeDirectory();
    QString path;
    const bool absolute = ConfigValue::toString(configured, &path) && QDir::isAbsolutePath(path);
    const QString real = absolute ? QFileInfo(path).canonicalFilePath() : QString();
    const bool system = real == QLatin1String("/proc") || real.startsWith(QLatin1String("/proc/"))
            || real == QLatin1String("/sys") || real.startsWith(QLatin1String("/sys/"))
            || real == QLatin1String("/dev") || real.startsWith(QLatin1String("/dev/"));
    if (!real.isEmpty() && !system && QFileInfo(real).isDir()) {
        forgetRefusal(m_directoryConfig);
        return QDir::cleanPath(path);
    }
    if (isNewRefusal(m_directoryConfig, configured)) {
        if (absolute && real.isEmpty())
            qCWarning(lcPelkanThemeLog) << "Theme: ignoring missing theme directory" << path;
        else
            qCWarning(lcPelkanThemeLog) << "Theme: ignoring invalid theme directory" << configured;
    }
    return defaultThemeDirectory();
}

QString Theme::defaultThemeDirectory()
{
    static const QString directory = [] {
        const QString installed = QStringLiteral(PELKAN_THEME_INSTALL_DIR);
        // Next to this library in a build tree (lib/ beside share/), or a relocated install.
        Dl_info info;
        if (dladdr(reinterpret_cast<void *>(&Theme::defaultThemeDirectory), &info) && info.dli_fname) {
            const QString beside = QFileInfo(QString::fromLocal8Bit(info.dli_fname)).absolutePath()
                    + QLatin1String("/../share/quorvane-pelkan/theme");
            if (QFileInfo(beside).isDir())
                return QDir::cleanPath(beside);
        }
        return installed;
    }();
    return directory;
}

} // namespace Pelkan
