#pragma once

#include <cstdint>

/// So many seconds of the processor's time, for this thread, from now on: what else the device does does not count.
class KestProcessorTime {
public:
    explicit KestProcessorTime(std::int64_t seconds);
    bool isOver() const;

private:
    std::int64_t end;
};
