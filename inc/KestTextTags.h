#pragma once

#include <string>

/// How much may still be done to the texts of one detail file: it can have any number of them, and a translation may
/// bring text tags of its own.
class KestTextWork {
public:
    /// Takes so many bytes of text that are searched or put in; false when there is not as much left.
    bool spend(size_t bytes);
    /// Takes one replacement of a text tag; false after 10,000 of them.
    bool spendReplacement();

private:
    size_t bytes_ = size_t(2) * 1024 * 1024 * 1024;
    int replacements_ = 10000;
};

/// The text tags of marked-up contents ("<text" to "</text>"), replaced one after the other from the front.
/// What the tags mean is their user's business.
class KestTextTags {
public:
    static const size_t longestContents = 1024 * 1024;

    /// `work` is spent on and outlives this object.
    KestTextTags(std::string contents, KestTextWork& work);

    /// The first tag of the contents; empty when there is none.
    std::string first();

    /// Puts `value` in place of the tag that first() gave, wherever it occurs. False when that is too much: no work is
    /// left, or the contents are, or would become, longer than longestContents; they stay as they are then.
    bool replaceFirst(const std::string& value);

    const std::string& contents() const { return contents_; }

private:
    size_t countOccurrences() const;

    std::string contents_;
    std::string tag_;
    /// Where the tag begins; no tag begins before it.
    size_t begin_;
    KestTextWork& work_;
};
