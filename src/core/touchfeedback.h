#pragma once

class QQuickItem;

namespace Pelkan {

// The touch tone a control plays when it is pressed. Controls ask for it here; what plays it
// (the sound profile's touch-tone level, through the engine's Util) is set up by the plugin,
// so that controls need not know the platform services. Without a player nothing happens.
namespace TouchFeedback {

using Player = void (*)(QQuickItem *pressed);

void setPlayer(Player player);
void play(QQuickItem *pressed);

} // namespace TouchFeedback
} // namespace Pelkan
