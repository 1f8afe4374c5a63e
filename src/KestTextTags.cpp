#include "KestTextTags.h"

#include "KestMarkup.h"

#include <utility>

namespace {

const char tagBegin[] = "<text";
const char tagEnd[] = "</text>";

/// A value is searched and copied so many times where it is put in.
const std::uint64_t passesOverValue = 8;

}  // namespace

const size_t KestTextTags::longestContents;
const int KestTextTags::mostReplacements;

KestTextTags::KestTextTags(std::string text, KestLoadWork& workOfLoad)
    : contents(std::move(text)), begin(0), replacements(0), work(workOfLoad) {}

std::string KestTextTags::first() {
    if (begin == std::string::npos) {
        return "";
    }
    // A value may have completed a beginning that stood in front of it.
    const size_t overlap = sizeof(tagBegin) - 2;
    begin = KestMarkup::find(contents, tagBegin, begin > overlap ? begin - overlap : 0);
    const size_t end = begin == std::string::npos ? begin : KestMarkup::find(contents, tagEnd, begin);
    tag = end == std::string::npos ? "" : contents.substr(begin, end + sizeof(tagEnd) - 1 - begin);
    return tag;
}

bool KestTextTags::replaceFirst(const std::string& value) {
    if (begin == std::string::npos || replacements == mostReplacements) {
        return false;
    }
    const size_t count = KestMarkup::count(contents, tag, begin);
    const size_t kept = contents.size() - count * tag.size();
    if (contents.size() > longestContents || value.size() > (longestContents - kept) / count) {
        return false;
    }
    if (!work.spendOnText(passesOverValue * count * value.size() + KestLoadWork::ofMoving(contents.size()))) {
        return false;
    }
    ++replacements;
    if (count == 1) {
        contents.replace(begin, tag.size(), value);
    } else {
        __replaceAll(value);
    }
    return true;
}

void KestTextTags::__replaceAll(const std::string& value) {
    std::string replaced(contents, 0, begin);
    size_t copied = begin;
    for (size_t at = begin; at != std::string::npos; at = KestMarkup::find(contents, tag, copied)) {
        replaced.append(contents, copied, at - copied).append(value);
        copied = at + tag.size();
    }
    contents = replaced.append(contents, copied, std::string::npos);
}
