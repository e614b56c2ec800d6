#pragma once

#include <QObject>

// Page stack operations and how they are carried out.
// Carries enumerations into QML only; never instantiated.
class DeclarativePageStackAction : public QObject
{
    Q_OBJECT

public:
    enum Action { Push = 0, Replace = 1, Pop = 2 };
    Q_ENUM(Action)

    enum OperationType { Animated = 0, Immediate = 1 };
    Q_ENUM(OperationType)
};
