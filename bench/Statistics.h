#pragma once

#include <algorithm>
#include <cmath>
#include <utility>
#include <vector>

namespace bench {

/// The value that `share` of all values, 0 to 1, do not exceed. There has to be one.
inline double quantile(std::vector<double> values, double share) {
    std::sort(values.begin(), values.end());
    return values[static_cast<size_t>(std::lround(static_cast<double>(values.size() - 1) * share))];
}

inline double median(std::vector<double> values) {
    return quantile(std::move(values), 0.5);
}

}  // namespace bench
