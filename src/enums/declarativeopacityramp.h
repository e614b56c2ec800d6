#pragma once

#include <QObject>

// Direction in which an opacity ramp fades.
// Carries enumerations into QML only; never instantiated.
class DeclarativeOpacityRamp : public QObject
{
    Q_OBJECT

public:
    enum Direction { LeftToRight = 0, RightToLeft = 1, TopToBottom = 2, BottomToTop = 3 };
    Q_ENUM(Direction)
};
