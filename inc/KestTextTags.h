#pragma once

#include <string>

/// The text tags of marked-up contents ("<text" to "</text>"), replaced one after the other from the front.
/// A translation may bring text tags of its own, so the work is bounded; what the tags mean is their user's business.
class KestTextTags {
public:
    static const size_t longestContents = 1024 * 1024;

    explicit KestTextTags(std::string contents);

    /// The first tag of the contents; empty when there is none.
    std::string first();

    /// Puts `value` in place of the tag that first() gave, wherever it occurs. False when that is too much: after
    /// 10,000 replacements, or when the contents are, or would become, longer than longestContents; they stay as they
    /// are then.
    bool replaceFirst(const std::string& value);

    const std::string& contents() const { return contents_; }

private:
    size_t countOccurrences() const;

    std::string contents_;
    std::string tag_;
    /// Where the tag begins; no tag begins before it.
    size_t begin_;
    int replacements_;
    size_t inserted_;
};
