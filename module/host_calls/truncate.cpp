#include "module/host_calls/truncate.h"

#include <cmath>
#include <limits>

int truncatedToInt(double value) {
    using Limits = std::numeric_limits<int>;
    if (std::isnan(value)) return 0;
    if (value >= Limits::max()) return Limits::max();
    if (value <= Limits::min()) return Limits::min();
    return static_cast<int>(value);
}
