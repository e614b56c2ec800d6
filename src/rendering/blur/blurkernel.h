#pragma once

#include <QSize>
#include <QVector>

// The arithmetic of the blur: Gaussian weights, the deviation a kernel implies, and the
// sizes of the levels of the blur pyramid.
namespace BlurKernel {

// Merged tap pairs on each side for kernel k (0 for 5 taps ... 7 for 33 taps).
inline int pairs(int kernel) { return kernel + 1; }

// The deviation a kernel implies: 1.2 for the five-tap kernel, otherwise (s + 1) * 3 / 10
// with s = 5, 7, ... 17 for the nine- to 33-tap kernels.
float derivedDeviation(int kernel);

// The 2p + 1 one-sided weights (centre first) of a normalised Gaussian of deviation
// sigma: the centre plus twice the rest sum to 1.
QVector<float> weights(float sigma, int kernel);

// The next level's size: each side halved, rounding up.
inline QSize halved(const QSize &size) { return QSize((size.width() + 1) / 2, (size.height() + 1) / 2); }

} // namespace BlurKernel
