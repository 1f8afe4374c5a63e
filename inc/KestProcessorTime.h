#pragma once

#include <cstdint>

/// So many seconds of the processor's time, for this thread, from now on: what else the device does does not count.
class KestProcessorTime {
public:
    explicit KestProcessorTime(std::int64_t seconds);

    /// Looks at the clock.
    bool isOver();
    /// The same after work of so many bytes more, but looks only once in a while: a look takes as long as handling a
    /// short text.
    bool isOverAfter(std::uint64_t bytes);

private:
    std::int64_t end;
    std::uint64_t workSinceLook;
    bool wasOver;
};
