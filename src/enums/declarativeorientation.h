#pragma once

#include <QObject>

// Screen orientations as single bits, so that they combine into masks: the same values
// serve as the Orientations flags of the window's allowed-orientation properties. The
// underlying type is fixed so that any int QML writes is a value of the type, which the
// setters then refuse or keep.
class DeclarativeOrientation : public QObject
{
    Q_OBJECT

public:
    enum Orientation : int {
        None = 0,
        Portrait = 1,
        Landscape = 2,
        PortraitInverted = 4,
        LandscapeInverted = 8,
        PortraitMask = Portrait | PortraitInverted,
        LandscapeMask = Landscape | LandscapeInverted,
        All = PortraitMask | LandscapeMask
    };
    Q_ENUM(Orientation)
    Q_DECLARE_FLAGS(Orientations, Orientation)
    Q_FLAG(Orientations)
};

Q_DECLARE_OPERATORS_FOR_FLAGS(DeclarativeOrientation::Orientations)
