#pragma once

#include <QObject>

// Hour display modes.
// Carries enumerations into QML only; never instantiated.
class DeclarativeDateTime : public QObject
{
    Q_OBJECT

public:
    enum HourMode { DefaultHours = 0, TwentyFourHours = 1, TwelveHours = 2 };
    Q_ENUM(HourMode)
};
