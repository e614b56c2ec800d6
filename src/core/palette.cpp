#include "palette.h"

#include <QSet>

namespace Pelkan {

// The palettes that follow the theme, told of its changes through one set of connections.
class ThemePalettes : public QObject
{
public:
    static ThemePalettes *instance()
    {
        // Left to the end of the process, as the theme is.
        static ThemePalettes *palettes = new ThemePalettes;
        return palettes;
    }

    void add(Palette *palette) { m_palettes.insert(palette); }
    void remove(Palette *palette) { m_palettes.remove(palette); }

private:
    ThemePalettes()
    {
        Theme *theme = Theme::instance();
        for (int role = 0; role < Theme::ColorRoleCount; ++role)
            connect(theme, Theme::colorSignal(Theme::ColorRole(role)), this, &ThemePalettes::themeChanged);
        connect(theme, &Theme::colorSchemeChanged, this, &ThemePalettes::themeChanged);
    }

    void themeChanged()
    {
        const QSet<Palette *> palettes = m_palettes; // a handler may make or delete palettes
        for (Palette *palette : palettes) {
            if (m_palettes.contains(palette))
                palette->sourceChanged();
        }
    }

    QSet<Palette *> m_palettes;
};

Palette::Palette(QObject *parent)
    : QObject(parent)
{
    ThemePalettes::instance()->add(this);
    for (int role = 0; role < Theme::ColorRoleCount; ++role)
        m_seen[role] = sourceColor(Theme::ColorRole(role));
    m_seenScheme = sourceScheme();
}

Palette::~Palette()
{
    if (m_inherited)
        m_inherited->m_dependents.removeOne(this);
    ThemePalettes::instance()->remove(this);
    // Those still inheriting from this one follow the theme from now on.
    const QVector<Palette *> dependents = m_dependents;
    for (Palette *dependent : dependents) {
        dependent->m_inherited = nullptr;
        ThemePalettes::instance()->add(dependent);
        dependent->sourceChanged();
    }
}

void (Palette::*Palette::colorSignal(Theme::ColorRole role))()
{
    static void (Palette::*const notifiers[Theme::ColorRoleCount])() = {
        &Palette::primaryColorChanged,
        &Palette::secondaryColorChanged,
        &Palette::highlightColorChanged,
        &Palette::secondaryHighlightColorChanged,
        &Palette::highlightBackgroundColorChanged,
        &Palette::overlayBackgroundColorChanged,
        &Palette::errorColorChanged,
        &Palette::backgroundColorChanged,
    };
    return notifiers[role];
}

QColor Palette::color(Theme::ColorRole role) const
{
    return isSet(role) ? m_colors[role] : sourceColor(role);
}

void Palette::setColor(Theme::ColorRole role, const QColor &color)
{
    m_colors[role] = color;
    m_set |= 1u << role;
    sourceChanged();
}

void Palette::resetColor(Theme::ColorRole role)
{
    m_set &= ~(1u << role);
    m_colors[role] = QColor();
    sourceChanged();
}

Theme::ColorScheme Palette::colorScheme() const
{
    return m_schemeSet ? m_scheme : sourceScheme();
}

void Palette::setColorScheme(Theme::ColorScheme scheme)
{
    m_scheme = scheme;
    m_schemeSet = true;
    sourceChanged();
}

void Palette::resetColorScheme()
{
    m_schemeSet = false;
    sourceChanged();
}

void Palette::setInheritedPalette(Palette *palette)
{
    if (palette == m_inherited || palette == this)
        return;
    follow(palette);
    sourceChanged();
}

void Palette::follow(Palette *source)
{
    if (m_inherited)
        m_inherited->m_dependents.removeOne(this);
    else
        ThemePalettes::instance()->remove(this);
    m_inherited = source;
    if (m_inherited)
        m_inherited->m_dependents.append(this);
    else
        ThemePalettes::instance()->add(this);
}

QColor Palette::sourceColor(Theme::ColorRole role) const
{
    return m_inherited ? m_inherited->color(role) : Theme::instance()->color(role);
}

Theme::ColorScheme Palette::sourceScheme() const
{
    return m_inherited ? m_inherited->colorScheme() : Theme::instance()->colorScheme();
}

// Re-resolves every colour, announces those whose visible value changed and, if any did,
// passes the change on to the palettes inheriting from this one.
void Palette::sourceChanged()
{
    bool changed = false;
    for (int role = 0; role < Theme::ColorRoleCount; ++role) {
        const QColor now = color(Theme::ColorRole(role));
        if (now != m_seen[role]) {
            m_seen[role] = now;
            changed = true;
            Q_EMIT (this->*colorSignal(Theme::ColorRole(role)))();
        }
    }
    const Theme::ColorScheme scheme = colorScheme();
    if (scheme != m_seenScheme) {
        m_seenScheme = scheme;
        changed = true;
        Q_EMIT colorSchemeChanged();
    }
    if (!changed)
        return;
    const QVector<Palette *> dependents = m_dependents; // a handler may move or delete them
    for (Palette *dependent : dependents) {
        if (m_dependents.contains(dependent))
            dependent->sourceChanged();
    }
}

} // namespace Pelkan
