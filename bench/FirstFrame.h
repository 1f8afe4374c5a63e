#pragma once

#include <ctime>
#include <sys/resource.h>

namespace bench {

/// What a program's process tells startup-bench, as bytes over a pipe, when it has drawn its first frame.
struct FirstFrame {
    timespec time;  ///< CLOCK_MONOTONIC
    rusage usage;   ///< of the process up to here
};

}  // namespace bench
