#pragma once

#include <QColor>
#include <QObject>

#include <functional>
#include <utility>

// A colour property that follows the theme until it is set, and resets to following it.
// `theme` gives the theme's value (read anew on each theme colour change); `changed` runs
// whenever the value an owner reads changes, set or following: the owner redraws and
// emits its change signal there.
class ThemedColor
{
public:
    ThemedColor(QObject *owner, std::function<QColor()> theme, std::function<void()> changed);
    Q_DISABLE_COPY(ThemedColor)

    QColor value() const { return m_set ? m_color : (m_followed = m_theme()); }
    void set(const QColor &color);
    void reset();

private:
    std::function<QColor()> m_theme;
    std::function<void()> m_changed;
    QColor m_color;
    mutable QColor m_followed; // the theme's value last read
    bool m_set = false;
};
