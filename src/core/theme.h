#pragma once

#include <QColor>
#include <QObject>
#include <QSize>
#include <QVector>

namespace Pelkan {

// Metrics and colours of the current theme.
//
// Everything is read from configuration keys below "/desktop/quorvane/pelkan/theme/"
// and follows them while the application runs:
//   pixel_ratio                  a number from MinPixelRatio to MaxPixelRatio; unset: the
//                                screen's width over 540, in quarter steps
//   color_scheme                 "lightondark" (default) or "darkonlight"
//   primary_color, secondary_color, highlight_color, secondary_highlight_color,
//   highlight_background_color, overlay_background_color, error_color, background_color
//                                any colour QColor parses ("#rrggbb", "#aarrggbb", names);
//                                unset colours derive from the scheme and from each other
//                                (error_color: text and lines of input that is not
//                                accepted; background_color: an application window's)
//   directory                    the theme folder (icons/, graphics/), an absolute path that
//                                is not below /proc, /sys or /dev; unset: the default theme
// Metrics are the reference design's pixel sizes multiplied by the pixel ratio, and all
// announce their change through pixelRatioChanged(). Invalid values, and values of the
// wrong type, are ignored with a warning and the default is used; the warning is given
// once per value, not again whenever another key changes.
//
// Every Theme of the process (each QML module has its own, besides instance()) reads one
// shared copy of the configuration: a change is read once, and all of them hold the new
// values before any of them announces it, so they agree at every moment.
class Theme : public QObject
{
    Q_OBJECT
    Q_PROPERTY(qreal pixelRatio READ pixelRatio NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal itemSizeSmall READ itemSizeSmall NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal itemSizeMedium READ itemSizeMedium NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal itemSizeLarge READ itemSizeLarge NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal itemSizeExtraLarge READ itemSizeExtraLarge NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal paddingSmall READ paddingSmall NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal paddingMedium READ paddingMedium NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal paddingLarge READ paddingLarge NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal horizontalPageMargin READ horizontalPageMargin NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal iconSizeSmall READ iconSizeSmall NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal iconSizeMedium READ iconSizeMedium NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal iconSizeLarge READ iconSizeLarge NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal fontSizeSmall READ fontSizeSmall NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal fontSizeMedium READ fontSizeMedium NOTIFY pixelRatioChanged)
    Q_PROPERTY(qreal fontSizeLarge READ fontSizeLarge NOTIFY pixelRatioChanged)
    Q_PROPERTY(QSize coverSizeSmall READ coverSizeSmall NOTIFY pixelRatioChanged)
    Q_PROPERTY(QSize coverSizeLarge READ coverSizeLarge NOTIFY pixelRatioChanged)
    Q_PROPERTY(ColorScheme colorScheme READ colorScheme NOTIFY colorSchemeChanged)
    Q_PROPERTY(QColor primaryColor READ primaryColor NOTIFY primaryColorChanged)
    Q_PROPERTY(QColor secondaryColor READ secondaryColor NOTIFY secondaryColorChanged)
    Q_PROPERTY(QColor highlightColor READ highlightColor NOTIFY highlightColorChanged)
    Q_PROPERTY(QColor secondaryHighlightColor READ secondaryHighlightColor NOTIFY secondaryHighlightColorChanged)
    Q_PROPERTY(QColor highlightBackgroundColor READ highlightBackgroundColor NOTIFY highlightBackgroundColorChanged)
    Q_PROPERTY(QColor overlayBackgroundColor READ overlayBackgroundColor NOTIFY overlayBackgroundColorChanged)
    Q_PROPERTY(QColor errorColor READ errorColor NOTIFY errorColorChanged)
    Q_PROPERTY(QColor backgroundColor READ backgroundColor NOTIFY backgroundColorChanged)
    Q_PROPERTY(QString themeDirectory READ themeDirectory NOTIFY themeDirectoryChanged)

public:
    enum ColorScheme { LightOnDark, DarkOnLight };
    Q_ENUM(ColorScheme)

    enum ColorRole {
        PrimaryColor,
        SecondaryColor,
        HighlightColor,
        SecondaryHighlightColor,
        HighlightBackgroundColor,
        OverlayBackgroundColor,
        ErrorColor,
        BackgroundColor,
        ColorRoleCount
    };
    Q_ENUM(ColorRole)

    static Theme *instance();

    // The pixel ratios a configuration may set; outside them covers and metrics collapse.
    static constexpr qreal MinPixelRatio = 0.5;
    static constexpr qreal MaxPixelRatio = 5.0;

    explicit Theme(QObject *parent = nullptr);
    ~Theme() override;

    qreal pixelRatio() const { return m_state->pixelRatio; }
    qreal itemSizeSmall() const { return scaled(80); }
    qreal itemSizeMedium() const { return scaled(100); }
    qreal itemSizeLarge() const { return scaled(120); }
    qreal itemSizeExtraLarge() const { return scaled(160); }
    qreal paddingSmall() const { return scaled(6); }
    qreal paddingMedium() const { return scaled(12); }
    qreal paddingLarge() const { return scaled(24); }
    qreal horizontalPageMargin() const { return scaled(24); }
    qreal iconSizeSmall() const { return scaled(32); }
    qreal iconSizeMedium() const { return scaled(64); }
    qreal iconSizeLarge() const { return scaled(96); }
    qreal fontSizeSmall() const { return scaled(22); }
    qreal fontSizeMedium() const { return scaled(26); }
    qreal fontSizeLarge() const { return scaled(34); }
    QSize coverSizeSmall() const { return scaledSize(148, 237); }
    QSize coverSizeLarge() const { return scaledSize(234, 374); }

    ColorScheme colorScheme() const { return m_state->scheme; }
    QColor color(ColorRole role) const { return m_state->colors.at(role); }
    QColor primaryColor() const { return color(PrimaryColor); }
    QColor secondaryColor() const { return color(SecondaryColor); }
    QColor highlightColor() const { return color(HighlightColor); }
    QColor secondaryHighlightColor() const { return color(SecondaryHighlightColor); }
    QColor highlightBackgroundColor() const { return color(HighlightBackgroundColor); }
    QColor overlayBackgroundColor() const { return color(OverlayBackgroundColor); }
    QColor errorColor() const { return color(ErrorColor); }
    QColor backgroundColor() const { return color(BackgroundColor); }

    QString themeDirectory() const { return m_state->directory; }

    // The colour with its alpha replaced by opacity (0..1).
    Q_INVOKABLE QColor rgba(const QColor &color, qreal opacity) const;
    // Rich text of text with every case-insensitive occurrence of pattern in color.
    Q_INVOKABLE QString highlightText(const QString &text, const QString &pattern, const QColor &color) const;

    // The signal announcing a change of the given colour role.
    static void (Theme::*colorSignal(ColorRole role))();
    static QString configurationPath();
    static QString defaultThemeDirectory();

Q_SIGNALS:
    void pixelRatioChanged();
    void colorSchemeChanged();
    void primaryColorChanged();
    void secondaryColorChanged();
    void highlightColorChanged();
    void secondaryHighlightColorChanged();
    void highlightBackgroundColorChanged();
    void overlayBackgroundColorChanged();
    void errorColorChanged();
    void backgroundColorChanged();
    void themeDirectoryChanged();

private:
    struct State {
        qreal pixelRatio = 1.0;
        ColorScheme scheme = LightOnDark;
        QVector<QColor> colors = QVector<QColor>(ColorRoleCount);
        QString directory;
    };
    // The configuration keys and what they hold now, shared by every Theme.
    class Configuration;
    friend class Configuration;

    qreal scaled(qreal size) const { return size * m_state->pixelRatio; }
    QSize scaledSize(int width, int height) const;
    // Announces what differs between old and the values now read.
    void announce(const State &old);

    const State *m_state;
    State m_detached; // the last values, once the shared configuration went before this
};

} // namespace Pelkan
