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

}  // namespace

KestLoadWork::KestLoadWork()
    : time(longestSeconds), textBytes(mostText), detailTextBytes(mostTextOfDetail), fileBytes(mostFiles),
      keptBytes(mostKept) {}

bool KestLoadWork::__take(std::uint64_t& left, std::uint64_t amount) {
    const bool isLate = time.isOverAfter(leastText + amount);
    const bool enough = amount <= left && !isLate;
    left = enough ? left - amount : 0;
    return enough;
}

void KestLoadWork::beginDetail() {
    time.isOver();
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
