#pragma once

#include <cstdint>

/// The processor's time that a load sees pass, ahead of the real one by so many seconds.
namespace processor_clock {

extern std::int64_t ahead;

/// While it lives that time stands still: what ends a load is what it does, however slow the machine is.
struct Standing {
    Standing();
    ~Standing();
    Standing(const Standing&) = delete;
    Standing& operator=(const Standing&) = delete;
};

}  // namespace processor_clock
