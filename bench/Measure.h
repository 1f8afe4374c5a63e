#pragma once

#include <ctime>

namespace bench {

inline double milliseconds(const timespec& time) {
    return static_cast<double>(time.tv_sec) * 1e3 + static_cast<double>(time.tv_nsec) / 1e6;
}

inline double millisecondsOf(clockid_t clock) {
    timespec time{};
    clock_gettime(clock, &time);
    return milliseconds(time);
}

/// Two times in milliseconds: what passed, and what of it the processor was had.
struct Cost {
    double passed = 0;
    double processor = 0;

    /// Of all threads of the process, or of the one that asks.
    static Cost ofProcess() { return {millisecondsOf(CLOCK_MONOTONIC), millisecondsOf(CLOCK_PROCESS_CPUTIME_ID)}; }
    static Cost ofThread() { return {millisecondsOf(CLOCK_MONOTONIC), millisecondsOf(CLOCK_THREAD_CPUTIME_ID)}; }
    Cost operator-(const Cost& other) const { return {passed - other.passed, processor - other.processor}; }
    Cost operator+(const Cost& other) const { return {passed + other.passed, processor + other.processor}; }
};

}  // namespace bench
