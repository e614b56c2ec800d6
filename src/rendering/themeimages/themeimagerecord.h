#pragma once

#include <QColor>
#include <QSize>
#include <QString>

// What is needed to decode a theme image again: its name, its tint and how it was made.
struct ThemeImageRecord {
    enum Tint { Copy, Colour, ThemePrimary };

    QString name;
    QColor color;       // the tint given in the id; invalid without one
    QSize imageSize;    // decoded size, without border
    Tint tint = Copy;
    bool hasAlpha = false;
    bool themeTinted = false; // follows the theme's primary colour

    // The colour the pixels are drawn in now (invalid: copied untinted).
    QColor effectiveColor() const;
};
