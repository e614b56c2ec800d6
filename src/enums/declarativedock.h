#pragma once

#include <QObject>

// Screen edges an item can be docked to.
// Carries enumerations into QML only; never instantiated.
class DeclarativeDock : public QObject
{
    Q_OBJECT

public:
    enum Dock { Left = 0, Top = 1, Right = 2, Bottom = 3 };
    Q_ENUM(Dock)
};
