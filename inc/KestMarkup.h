#pragma once

#include <string>

/// What the catalogue does with the markup of contents and translations. Static; holds no state.
class KestMarkup {
public:
    /// Where `what` occurs in the text at `from` or after it, else std::string::npos. Unlike std::string's own search
    /// it stays linear where the text is full of beginnings of what is searched.
    static size_t find(const std::string& text, const std::string& what, size_t from);
    /// How often it occurs there, one after the other.
    static size_t count(const std::string& text, const std::string& what, size_t from = 0);
    /// Replaces `from` by `to`, the first time or every time that it occurs; what is put in is not searched again.
    static std::string replaceString(const std::string& text, const std::string& from, const std::string& to,
                                     bool firstOnly);
    /// From the first `start` to the next `end`, with both or without them. Empty when one of them is missing.
    static std::string extractString(const std::string& text, const std::string& start, const std::string& end,
                                     bool inclusive);

    /// A translation as it goes into marked-up contents: its line breaks small, its ampersands escaped.
    static std::string fromTranslation(const std::string& value);

    /// Old contents without the icon and the title that stand in them, and without line breaks if both did.
    static std::string cleanOldContents(const std::string& contents);
};
