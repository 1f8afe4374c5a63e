#pragma once

#include "KestLoadWork.h"

#include <string>

/// The text tags of marked-up contents ("<text" to "</text>"), replaced one after the other from the front.
/// What the tags mean is their user's business.
class KestTextTags {
public:
    static const size_t longestContents = 1024 * 1024;
    static const int mostReplacements = 10000;

    /// `workOfLoad` is spent on and outlives this object.
    KestTextTags(std::string text, KestLoadWork& workOfLoad);

    /// The first tag of the contents; empty when there is none.
    std::string first();

    /// Puts `value` in place of the tag that first() gave, wherever it occurs. False when that is too much: after
    /// mostReplacements, when no work is left, or when the contents are, or would become, longer than
    /// longestContents; they stay as they are then.
    bool replaceFirst(const std::string& value);

    const std::string& result() const { return contents; }

private:
    void __replaceAll(const std::string& value);

    std::string contents;
    std::string tag;
    /// Where the tag begins; no tag begins before it.
    size_t begin;
    int replacements;
    KestLoadWork& work;
};
