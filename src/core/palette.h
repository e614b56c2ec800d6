#pragma once

#include "theme.h"

#include <QColor>
#include <QObject>
#include <QVector>

namespace Pelkan {

// The colours an item draws with. Each colour follows its source (the palette it inherits
// from, otherwise the process theme) until it is set, and follows it again once reset.
// Controls inherit the palette of their nearest ancestor control.
//
// A page of hundreds of controls makes a palette for each, so following costs no signal
// connections: a palette tells the palettes inheriting from it directly, and the palettes
// that follow the theme hear of its changes through one connection the theme has for all
// of them.
class Palette : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QColor primaryColor READ primaryColor WRITE setPrimaryColor RESET resetPrimaryColor NOTIFY primaryColorChanged)
    Q_PROPERTY(QColor secondaryColor READ secondaryColor WRITE setSecondaryColor RESET resetSecondaryColor NOTIFY secondaryColorChanged)
    Q_PROPERTY(QColor highlightColor READ highlightColor WRITE setHighlightColor RESET resetHighlightColor NOTIFY highlightColorChanged)
    Q_PROPERTY(QColor secondaryHighlightColor READ secondaryHighlightColor WRITE setSecondaryHighlightColor RESET resetSecondaryHighlightColor NOTIFY secondaryHighlightColorChanged)
    Q_PROPERTY(QColor highlightBackgroundColor READ highlightBackgroundColor WRITE setHighlightBackgroundColor RESET resetHighlightBackgroundColor NOTIFY highlightBackgroundColorChanged)
    Q_PROPERTY(QColor overlayBackgroundColor READ overlayBackgroundColor WRITE setOverlayBackgroundColor RESET resetOverlayBackgroundColor NOTIFY overlayBackgroundColorChanged)
    Q_PROPERTY(QColor errorColor READ errorColor WRITE setErrorColor RESET resetErrorColor NOTIFY errorColorChanged)
    Q_PROPERTY(QColor backgroundColor READ backgroundColor WRITE setBackgroundColor RESET resetBackgroundColor NOTIFY backgroundColorChanged)
    Q_PROPERTY(Pelkan::Theme::ColorScheme colorScheme READ colorScheme WRITE setColorScheme RESET resetColorScheme NOTIFY colorSchemeChanged)

public:
    explicit Palette(QObject *parent = nullptr);
    ~Palette() override;

    QColor color(Theme::ColorRole role) const;
    void setColor(Theme::ColorRole role, const QColor &color);
    void resetColor(Theme::ColorRole role);
    bool isSet(Theme::ColorRole role) const { return m_set & (1u << role); }

    QColor primaryColor() const { return color(Theme::PrimaryColor); }
    void setPrimaryColor(const QColor &c) { setColor(Theme::PrimaryColor, c); }
    void resetPrimaryColor() { resetColor(Theme::PrimaryColor); }
    QColor secondaryColor() const { return color(Theme::SecondaryColor); }
    void setSecondaryColor(const QColor &c) { setColor(Theme::SecondaryColor, c); }
    void resetSecondaryColor() { resetColor(Theme::SecondaryColor); }
    QColor highlightColor() const { return color(Theme::HighlightColor); }
    void setHighlightColor(const QColor &c) { setColor(Theme::HighlightColor, c); }
    void resetHighlightColor() { resetColor(Theme::HighlightColor); }
    QColor secondaryHighlightColor() const { return color(Theme::SecondaryHighlightColor); }
    void setSecondaryHighlightColor(const QColor &c) { setColor(Theme::SecondaryHighlightColor, c); }
    void resetSecondaryHighlightColor() { resetColor(Theme::SecondaryHighlightColor); }
    QColor highlightBackgroundColor() const { return color(Theme::HighlightBackgroundColor); }
    void setHighlightBackgroundColor(const QColor &c) { setColor(Theme::HighlightBackgroundColor, c); }
    void resetHighlightBackgroundColor() { resetColor(Theme::HighlightBackgroundColor); }
    QColor overlayBackgroundColor() const { return color(Theme::OverlayBackgroundColor); }
    void setOverlayBackgroundColor(const QColor &c) { setColor(Theme::OverlayBackgroundColor, c); }
    void resetOverlayBackgroundColor() { resetColor(Theme::OverlayBackgroundColor); }
    QColor errorColor() const { return color(Theme::ErrorColor); }
    void setErrorColor(const QColor &c) { setColor(Theme::ErrorColor, c); }
    void resetErrorColor() { resetColor(Theme::ErrorColor); }
    QColor backgroundColor() const { return color(Theme::BackgroundColor); }
    void setBackgroundColor(const QColor &c) { setColor(Theme::BackgroundColor, c); }
    void resetBackgroundColor() { resetColor(Theme::BackgroundColor); }

    Theme::ColorScheme colorScheme() const;
    void setColorScheme(Theme::ColorScheme scheme);
    void resetColorScheme();

    // The palette unset colours come from; null means the process theme.
    Palette *inheritedPalette() const { return m_inherited; }
    void setInheritedPalette(Palette *palette);

Q_SIGNALS:
    void primaryColorChanged();
    void secondaryColorChanged();
    void highlightColorChanged();
    void secondaryHighlightColorChanged();
    void highlightBackgroundColorChanged();
    void overlayBackgroundColorChanged();
    void errorColorChanged();
    void backgroundColorChanged();
    void colorSchemeChanged();

private:
    friend class ThemePalettes;

    static void (Palette::*colorSignal(Theme::ColorRole role))();
    QColor sourceColor(Theme::ColorRole role) const;
    Theme::ColorScheme sourceScheme() const;
    void follow(Palette *source);
    void sourceChanged();

    QColor m_colors[Theme::ColorRoleCount];
    Theme::ColorScheme m_scheme = Theme::LightOnDark;
    unsigned m_set = 0;
    bool m_schemeSet = false;
    Palette *m_inherited = nullptr;
    // The palettes inheriting from this one.
    QVector<Palette *> m_dependents;
    // What readers saw last, so that a source change notifies only what really changed.
    QColor m_seen[Theme::ColorRoleCount];
    Theme::ColorScheme m_seenScheme;
};

} // namespace Pelkan
