#pragma once

#include <ctime>

namespace device {

/// Seconds since the machine was started: the same clock for all processes, which nobody sets, and by which the kernel
/// tells when each began.
inline double secondsSinceBoot() {
    timespec time{};
    clock_gettime(CLOCK_BOOTTIME, &time);
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_nsec) / 1e9;
}

}  // namespace device
