#pragma once

#include <QString>

namespace Pelkan {

// Maps a theme icon name to the file that draws it.
//
// A name is looked up in the theme's "icons" folder, then its "graphics" folder; in each,
// the subfolder for the pixel ratio ("z1.0", "z1.25", "z2.0", ...) is preferred over the
// folder itself, and a ".png" over a ".svg". A name that already ends in ".png", ".svg" or
// ".jpg" is looked up as it stands. Absolute paths and file URLs pass through unchanged
// (as a local path); any other name containing "/" or a ".." part, and unknown names,
// resolve to an empty string.
//
// Results, including misses, are cached process-wide per theme folder and ratio, so the
// same lookup costs one hash probe after the first time. The cache may be read from image
// loader threads; construct resolvers on the GUI thread (the default constructor reads the
// current theme).
class ThemeIconResolver
{
public:
    ThemeIconResolver();
    ThemeIconResolver(const QString &themeDirectory, qreal pixelRatio);

    QString themeDirectory() const { return m_directory; }
    qreal pixelRatio() const { return m_pixelRatio; }

    QString resolvePath(const QString &name) const;

    // Forgets every cached lookup, for example after files were added to a theme.
    static void clearCache();

    // The folder name used for a pixel ratio: "z1.0", "z1.25", "z2.0".
    static QString ratioFolder(qreal pixelRatio);

private:
    QString search(const QString &name) const;

    QString m_directory;
    qreal m_pixelRatio;
    QString m_ratioFolder;
};

} // namespace Pelkan
