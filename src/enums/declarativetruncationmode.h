#pragma once

#include <QObject>

// How text that does not fit is cut.
// Carries enumerations into QML only; never instantiated.
class DeclarativeTruncationMode : public QObject
{
    Q_OBJECT

public:
    enum Mode { None = 0, Elide = 1, Fade = 2 };
    Q_ENUM(Mode)
};
