#pragma once

#include <QObject>

// Busy indicator sizes.
// Carries enumerations into QML only; never instantiated.
class DeclarativeBusyIndicatorSize : public QObject
{
    Q_OBJECT

public:
    enum Size { ExtraSmall = 0, Small = 1, Medium = 2, Large = 3 };
    Q_ENUM(Size)
};
