#pragma once

#include <QObject>

// How a dialog was closed.
// Carries enumerations into QML only; never instantiated.
class DeclarativeDialogResult : public QObject
{
    Q_OBJECT

public:
    enum Result { None = 0, Accepted = 1, Rejected = 2 };
    Q_ENUM(Result)
};
