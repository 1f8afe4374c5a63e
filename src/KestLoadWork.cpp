#include "KestLoadWork.h"

namespace {

const size_t mebibyte = 1024 * 1024;

/// None takes longer than a few seconds.
const size_t mostTextOfDetail = 1024 * mebibyte;
const size_t mostText = 4 * mostTextOfDetail;
const size_t mostFiles = 256 * mebibyte;

/// Looking up a short text costs as much as copying one of this length.
const size_t leastText = 4096;

bool take(size_t& left, size_t amount) {
    if (amount > left) {
        return false;
    }
    left -= amount;
    return true;
}

}  // namespace

KestLoadWork::KestLoadWork() : textBytes(mostText), detailTextBytes(mostTextOfDetail), fileBytes(mostFiles) {}

void KestLoadWork::beginDetail() {
    detailTextBytes = mostTextOfDetail;
}

bool KestLoadWork::spendOnText(size_t bytes) {
    return bytes <= textBytes && take(detailTextBytes, leastText + bytes) && take(textBytes, leastText + bytes);
}

bool KestLoadWork::spendOnFile(size_t bytes) {
    return take(fileBytes, bytes);
}
