#include "KestLoadWork.h"

#include <ctime>

namespace {

const std::uint64_t mebibyte = 1024 * 1024;

const std::uint64_t mostTextOfDetail = 1024 * mebibyte;
const std::uint64_t mostText = 4 * mostTextOfDetail;
const std::uint64_t mostFiles = 256 * mebibyte;
const std::uint64_t mostKept = 64 * mebibyte;

/// Looking up a short text costs as much as copying one of this length.
const std::uint64_t leastText = 4096;

const std::int64_t nanosecondsOfSecond = 1000000000;
const std::int64_t longest = 10 * nanosecondsOfSecond;

/// Of the processor, for this thread: what else the device does is not the load's.
std::int64_t now() {
    timespec time{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return time.tv_sec * nanosecondsOfSecond + time.tv_nsec;
}

}  // namespace

KestLoadWork::KestLoadWork()
    : begin(now()), textBytes(mostText), detailTextBytes(mostTextOfDetail), fileBytes(mostFiles), keptBytes(mostKept) {}

bool KestLoadWork::__take(std::uint64_t& left, std::uint64_t amount) const {
    const bool enough = amount <= left && now() - begin < longest;
    left = enough ? left - amount : 0;
    return enough;
}

void KestLoadWork::beginDetail() {
    detailTextBytes = mostTextOfDetail;
}

bool KestLoadWork::spendOnText(std::uint64_t bytes) {
    const std::uint64_t cost = leastText + bytes;
    return __take(detailTextBytes, cost) && __take(textBytes, cost);
}

bool KestLoadWork::spendOnFile(std::uint64_t bytes) {
    return __take(fileBytes, bytes);
}

bool KestLoadWork::spendOnKeeping(std::uint64_t bytes) {
    return __take(keptBytes, bytes);
}
