#include "KestProcessorTime.h"

#include <ctime>

namespace {

const std::int64_t nanosecondsOfSecond = 1000000000;
const std::uint64_t workBetweenLooks = 64 * 1024;

std::int64_t now() {
    timespec time{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return time.tv_sec * nanosecondsOfSecond + time.tv_nsec;
}

}  // namespace

KestProcessorTime::KestProcessorTime(std::int64_t seconds)
    : end(now() + seconds * nanosecondsOfSecond), workSinceLook(0), wasOver(false) {}

bool KestProcessorTime::isOver() {
    workSinceLook = 0;
    wasOver = now() >= end;
    return wasOver;
}

bool KestProcessorTime::isOverAfter(std::uint64_t bytes) {
    workSinceLook += bytes;
    return workSinceLook >= workBetweenLooks ? isOver() : wasOver;
}
