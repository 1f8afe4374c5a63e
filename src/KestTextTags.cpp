#include "KestTextTags.h"

#include "KestMarkup.h"

#include <utility>

namespace {

const char tagBegin[] = "<text";
const char tagEnd[] = "</text>";

const int mostReplacements = 10000;
/// Long tags that bring each other back reach this long before the number of replacements ends them.
const size_t mostInserted = 64 * KestTextTags::longestContents;

}  // namespace

const size_t KestTextTags::longestContents;

KestTextTags::KestTextTags(std::string contents)
    : contents_(std::move(contents)), begin_(0), replacements_(0), inserted_(0) {}

std::string KestTextTags::first() {
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
    const size_t kept = contents_.size() - count * tag_.size();
    const bool tooLong = contents_.size() > longestContents || value.size() > (longestContents - kept) / count;
    inserted_ += tooLong ? 0 : count * value.size();
    if (tooLong || inserted_ > mostInserted || replacements_ == mostReplacements) {
        return false;
    }
    ++replacements_;
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
