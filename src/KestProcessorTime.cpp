#include "KestProcessorTime.h"

#include <ctime>

namespace {

const std::int64_t nanosecondsOfSecond = 1000000000;

std::int64_t now() {
    timespec time{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return time.tv_sec * nanosecondsOfSecond + time.tv_nsec;
}

}  // namespace

KestProcessorTime::KestProcessorTime(std::int64_t seconds) : end(now() + seconds * nanosecondsOfSecond) {}

bool KestProcessorTime::isOver() const {
    return now() >= end;
}
