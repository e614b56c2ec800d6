#include "palette.h"

namespace Pelkan {

Palette::Palette(QObject *parent)
    : QObject(parent)
{
    connectSource(Theme::instance(), true);
    for (int role = 0; role < Theme::ColorRoleCount; ++role)
        m_seen[role] = sourceColor(Theme::ColorRole(role));
    m_seenScheme = sourceScheme();
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
    connectSource(m_inherited ? static_cast<QObject *>(m_inherited) : Theme::instance(), false);
    m_inherited = palette;
    connectSource(m_inherited ? static_cast<QObject *>(m_inherited) : Theme::instance(), true);
    sourceChanged();
}

QColor Palette::sourceColor(Theme::ColorRole role) const
{
    return m_inherited ? m_inherited->color(role) : Theme::instance()->color(role);
}

Theme::ColorScheme Palette::sourceScheme() const
{
    return m_inherited ? m_inherited->colorScheme() : Theme::instance()->colorScheme();
}

void Palette::connectSource(QObject *source, bool connect)
{
    if (!source)
        return;
    if (!connect) {
        QObject::disconnect(source, nullptr, this, nullptr);
        return;
    }
    // Any colour or scheme change of the source re-resolves this palette; only the roles
    // whose visible value changed are announced.
    if (auto palette = qobject_cast<Palette *>(source)) {
        for (int role = 0; role < Theme::ColorRoleCount; ++role)
            QObject::connect(palette, colorSignal(Theme::ColorRole(role)), this, &Palette::sourceChanged);
        QObject::connect(palette, &Palette::colorSchemeChanged, this, &Palette::sourceChanged);
        QObject::connect(palette, &QObject::destroyed, this, [this] {
            // The guarded pointer is already null here: fall back to the theme.
            m_inherited = nullptr;
            connectSource(Theme::instance(), true);
            sourceChanged();
        });
    } else if (auto theme = qobject_cast<Theme *>(source)) {
        for (int role = 0; role < Theme::ColorRoleCount; ++role)
            QObject::connect(theme, Theme::colorSignal(Theme::ColorRole(role)), this, &Palette::sourceChanged);
        QObject::connect(theme, &Theme::colorSchemeChanged, this, &Palette::sourceChanged);
    }
}

void Palette::sourceChanged()
{
    for (int role = 0; role < Theme::ColorRoleCount; ++role) {
        const QColor now = color(Theme::ColorRole(role));
        if (now != m_seen[role]) {
            m_seen[role] = now;
            Q_EMIT (this->*colorSignal(Theme::ColorRole(role)))();
        }
    }
    const Theme::ColorScheme scheme = colorScheme();
    if (scheme != m_seenScheme) {
        m_seenScheme = scheme;
        Q_EMIT colorSchemeChanged();
    }
}

} // namespace Pelkan
