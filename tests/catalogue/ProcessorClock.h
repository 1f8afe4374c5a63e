#pragma once

#include <cstdint>

/// The processor's time that a load sees pass, ahead of the real one by so many seconds.
namespace processor_clock {

extern std::int64_t ahead;

}  // namespace processor_clock
