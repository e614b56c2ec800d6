import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// A speech bubble behind a chat message: a rounded body and a tail on `tailEdge`,
// `tailOffset` pixels along it (negative: from its end), `tailSize` long, leaning
// `tailDirection` degrees. The tail stays inside the item: size the item to the message
// plus the tail. The theme's highlight background at 0.3 until `color` is set.
Private.BubbleBackground {
    radius: Theme.paddingLarge
}
