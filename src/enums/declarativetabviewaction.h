#pragma once

#include <QObject>

// How a tab view operation is carried out.
// Carries enumerations into QML only; never instantiated.
class DeclarativeTabViewAction : public QObject
{
    Q_OBJECT

public:
    enum OperationType { Animated = 0, Immediate = 1 };
    Q_ENUM(OperationType)
};
