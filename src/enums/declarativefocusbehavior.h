#pragma once

#include <QObject>

// What happens to focus when a page or item is left.
// Carries enumerations into QML only; never instantiated.
class DeclarativeFocusBehavior : public QObject
{
    Q_OBJECT

public:
    enum FocusBehavior { ClearItemFocus = 0, ClearPageFocus = 1, KeepFocus = 2 };
    Q_ENUM(FocusBehavior)
};
