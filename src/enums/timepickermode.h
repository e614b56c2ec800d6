#pragma once

#include <QObject>

// What a time picker edits.
// Carries enumerations into QML only; never instantiated.
class TimePickerMode : public QObject
{
    Q_OBJECT

public:
    enum Mode { HoursAndMinutes = 0, MinutesAndSeconds = 1 };
    Q_ENUM(Mode)
};
