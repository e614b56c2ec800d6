#pragma once

#include <QObject>

// Page navigation kinds, directions and styles. None is a second name for 0, declared
// after Forward so that NoNavigation stays the first name of 0.
// Carries enumerations into QML only; never instantiated.
class DeclarativePageNavigation : public QObject
{
    Q_OBJECT

public:
    enum Navigation { NoNavigation = 0, Back = 1, Forward = 2, None = 0 };
    Q_ENUM(Navigation)

    enum Direction { NoDirection = 0, Up = 1, Down = 2, Left = 3, Right = 4 };
    Q_ENUM(Direction)

    enum Style { Horizontal = 0, Vertical = 1 };
    Q_ENUM(Style)
};
