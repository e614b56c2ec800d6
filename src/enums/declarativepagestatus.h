#pragma once

#include <QObject>

// Page lifecycle states.
// Carries enumerations into QML only; never instantiated.
class DeclarativePageStatus : public QObject
{
    Q_OBJECT

public:
    enum Status { Inactive = 0, Activating = 1, Active = 2, Deactivating = 3 };
    Q_ENUM(Status)
};
