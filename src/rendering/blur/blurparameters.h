#pragma once

#include <QColor>

// What the GUI thread hands to the render thread for one blur.
struct BlurParameters {
    bool blur = true;
    int kernel = 1;
    int levels = 3;
    int iterations = 1;
    bool iterateAllLevels = false;
    float deviation = 1.5f;
    float intensity = 1.0f;
    QColor overlayColor = Qt::transparent;

    bool sameBlur(const BlurParameters &other) const
    {
        return blur == other.blur && kernel == other.kernel && levels == other.levels && iterations == other.iterations
                && iterateAllLevels == other.iterateAllLevels && deviation == other.deviation;
    }
};
