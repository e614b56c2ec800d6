#pragma once

#include <QObject>

// Directions and kinds of touch interaction hints.
// Carries enumerations into QML only; never instantiated.
class DeclarativeTouchInteraction : public QObject
{
    Q_OBJECT

public:
    enum Direction { Left = 0, Up = 1, Right = 2, Down = 3 };
    Q_ENUM(Direction)

    enum Mode { Swipe = 0, EdgeSwipe = 1, Pull = 2 };
    Q_ENUM(Mode)
};
