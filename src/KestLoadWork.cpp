#include "KestLoadWork.h"

namespace {

const std::uint64_t mebibyte = 1024 * 1024;

const std::uint64_t mostTextOfDetail = 1024 * mebibyte;
const std::uint64_t mostText = 4 * mostTextOfDetail;
const std::uint64_t mostFiles = 256 * mebibyte;
const std::uint64_t mostKept = 64 * mebibyte;

/// Looking up a short text costs as much as copying one of this length.
const std::uint64_t leastText = 4096;

const std::int64_t longestSeconds = 10;

/// Looking at the clock takes as long as handling a short text, so it waits until there was work of so many bytes.
const std::uint64_t workBetweenLooks = 128 * 1024;

}  // namespace

KestLoadWork::KestLoadWork()
    : time(longestSeconds), textBytes(mostText), detailTextBytes(mostTextOfDetail), fileBytes(mostFiles),
      keptBytes(mostKept), workSinceLook(0), isLate(false) {}

bool KestLoadWork::__take(std::uint64_t& left, std::uint64_t amount) {
    workSinceLook += leastText + amount;
    if (workSinceLook >= workBetweenLooks) {
        __lookAtClock();
    }
    const bool enough = amount <= left && !isLate;
    left = enough ? left - amount : 0;
    return enough;
}

void KestLoadWork::__lookAtClock() {
    workSinceLook = 0;
    isLate = time.isOver();
}

void KestLoadWork::beginDetail() {
    __lookAtClock();
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
