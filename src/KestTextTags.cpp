#include "KestTextTags.h"

#include "KestMarkup.h"

#include <utility>

namespace {

const char tagBegin[] = "<text";
const char tagEnd[] = "</text>";

}  // namespace

const size_t KestTextTags::longestContents;

bool KestTextWork::spend(size_t bytes) {
    if (bytes > bytes_) {
        return false;
    }
    bytes_ -= bytes;
    return true;
}

bool KestTextWork::spendReplacement() {
    if (replacements_ == 0) {
        return false;
    }
    --replacements_;
    return true;
}

KestTextTags::KestTextTags(std::string contents, KestTextWork& work)
    : contents_(std::move(contents)), begin_(0), work_(work) {}

std::string KestTextTags::first() {
    if (begin_ == std::string::npos) {
        return "";
    }
    // A value may have completed a beginning that stood in front of it.
    const size_t overlap = sizeof(tagBegin) - 2;
    begin_ = KestMarkup::find(contents_, tagBegin, begin_ > overlap ? begin_ - overlap : 0);
    const size_t end = begin_ == std::string::npos ? begin_ : KestMarkup::find(contents_, tagEnd, begin_);
    tag_ = end == std::string::npos ? "" : contents_.substr(begin_, end + sizeof(tagEnd) - 1 - begin_);
    return tag_;
}

size_t KestTextTags::countOccurrences() const {
    size_t count = 0;
    for (size_t at = begin_; at != std::string::npos; at = KestMarkup::find(contents_, tag_, at + tag_.size())) {
        ++count;
    }
    return count;
}

bool KestTextTags::replaceFirst(const std::string& value) {
    const size_t count = countOccurrences();
    if (count == 0) {
        return false;
    }
    const size_t kept = contents_.size() - count * tag_.size();
    const bool tooLong = contents_.size() > longestContents || value.size() > (longestContents - kept) / count;
    if (tooLong || !work_.spend(count * value.size()) || !work_.spendReplacement()) {
        return false;
    }
    if (count == 1) {
        contents_.replace(begin_, tag_.size(), value);
        return true;
    }
    std::string replaced(contents_, 0, begin_);
    size_t copied = begin_;
    for (size_t at = begin_; at != std::string::npos; at = KestMarkup::find(contents_, tag_, copied)) {
        replaced.append(contents_, copied, at - copied).append(value);
        copied = at + tag_.size();
    }
    contents_ = replaced.append(contents_, copied, std::string::npos);
    return true;
}
