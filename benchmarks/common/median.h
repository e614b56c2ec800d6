#pragma once

#include <algorithm>
#include <vector>

// The middle of a set of timings (the upper middle of an even set).
inline double median(std::vector<double> values)
{
    if (values.empty())
        return 0;
    std::sort(values.begin(), values.end());
    return values[values.size() / 2];
}
