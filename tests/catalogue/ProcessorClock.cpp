#include "ProcessorClock.h"

#include <ctime>

namespace {

bool stands = false;

}  // namespace

std::int64_t processor_clock::ahead = 0;

processor_clock::Standing::Standing() {
    stands = true;
}

processor_clock::Standing::~Standing() {
    stands = false;
}

extern "C" {
int __real_clock_gettime(clockid_t clock, timespec* time);
int __wrap_clock_gettime(clockid_t clock, timespec* time);
}

int __wrap_clock_gettime(clockid_t clock, timespec* time) {
    const int result = __real_clock_gettime(clock, time);
    if (clock != CLOCK_THREAD_CPUTIME_ID)
        return result;
    if (stands)
        *time = {0, 0};
    time->tv_sec += processor_clock::ahead;
    return result;
}
