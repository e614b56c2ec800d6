#include "themedcolor.h"

#include "core/theme.h"

ThemedColor::ThemedColor(QObject *owner, std::function<QColor()> theme, std::function<void()> changed)
    : m_theme(std::move(theme))
    , m_changed(std::move(changed))
{
    Pelkan::Theme *source = Pelkan::Theme::instance();
    for (int role = 0; role < Pelkan::Theme::ColorRoleCount; ++role) {
        QObject::connect(source, Pelkan::Theme::colorSignal(Pelkan::Theme::ColorRole(role)), owner, [this] {
            const QColor followed = m_theme();
            if (followed == std::exchange(m_followed, followed))
                return;
            if (!m_set)
                m_changed();
        });
    }
}

void ThemedColor::set(const QColor &color)
{
    if (m_set && color == m_color)
        return;
    m_color = color;
    m_set = true;
    m_changed();
}

void ThemedColor::reset()
{
    if (!std::exchange(m_set, false))
        return;
    m_changed();
}
