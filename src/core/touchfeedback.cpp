#include "touchfeedback.h"

#include <atomic>

namespace Pelkan {
namespace TouchFeedback {

namespace {
std::atomic<Player> s_player { nullptr };
}

void setPlayer(Player player)
{
    s_player = player;
}

void play(QQuickItem *pressed)
{
    if (Player player = s_player)
        player(pressed);
}

} // namespace TouchFeedback
} // namespace Pelkan
