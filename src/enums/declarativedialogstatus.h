#pragma once

#include <QObject>

// Dialog lifecycle states.
// Carries enumerations into QML only; never instantiated.
class DeclarativeDialogStatus : public QObject
{
    Q_OBJECT

public:
    enum Status { Closed = 0, Opening = 1, Opened = 2, Closing = 3 };
    Q_ENUM(Status)
};
