#include "blurkernel.h"

#include <cmath>

namespace BlurKernel {

float derivedDeviation(int kernel)
{
    if (kernel < 1)
        return 1.2f;
    static const int sides[] = { 5, 7, 9, 11, 13, 15, 17 };
    return (sides[qMin(kernel, 7) - 1] + 1) * 3.0f / 10.0f;
}

QVector<float> weights(float sigma, int kernel)
{
    const int count = 2 * pairs(kernel) + 1;
    QVector<float> w(count);
    // The square of sigma in the first factor cancels out in the normalisation below.
    w[0] = float(1.0 / (double(sigma) * sigma * 2.5066282746310002));
    double sum = w[0];
    const double exponent = -1.0 / (2.0 * double(sigma) * sigma);
    for (int i = 1; i < count; ++i) {
        w[i] = float(std::exp(i * exponent * i) * w[0]);
        sum += 2.0 * w[i];
    }
    for (float &weight : w)
        weight = float(weight / sum);
    return w;
}

} // namespace BlurKernel
