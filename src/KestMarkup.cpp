#include "KestMarkup.h"

#include <cstring>

size_t KestMarkup::find(const std::string& text, const std::string& what, size_t from) {
    const void* found = memmem(text.data() + from, text.size() - from, what.data(), what.size());
    return found ? static_cast<size_t>(static_cast<const char*>(found) - text.data()) : std::string::npos;
}

size_t KestMarkup::count(const std::string& text, const std::string& what, size_t from) {
    size_t count = 0;
    for (size_t at = find(text, what, from); at != std::string::npos; at = find(text, what, at + what.size())) {
        ++count;
    }
    return count;
}

std::string KestMarkup::replaceString(const std::string& text, const std::string& from, const std::string& to,
                                      bool firstOnly) {
    std::string result;
    size_t copied = 0;
    size_t found = find(text, from, 0);
    while (found != std::string::npos) {
        result.append(text, copied, found - copied).append(to);
        copied = found + from.size();
        found = firstOnly || from.empty() ? std::string::npos : find(text, from, copied);
    }
    return result.append(text, copied, std::string::npos);
}

std::string KestMarkup::extractString(const std::string& text, const std::string& start, const std::string& end,
                                      bool inclusive) {
    const size_t found = find(text, start, 0);
    if (found == std::string::npos) {
        return "";
    }
    const size_t from = inclusive ? found : found + start.size();
    const size_t last = find(text, end, from);
    if (last == std::string::npos) {
        return "";
    }
    return text.substr(from, last - from + (inclusive ? end.size() : 0));
}

std::string KestMarkup::fromTranslation(const std::string& value) {
    const std::string lineBreak = "<font_size=16><br/></>";
    std::string markup = replaceString(value, "\n", lineBreak, false);
    markup = replaceString(markup, "\\n", lineBreak, false);
    return replaceString(markup, "&", "&amp;", false);
}

std::string KestMarkup::cleanOldContents(const std::string& contents) {
    const std::string icon = extractString(contents, "<item", "</item>", true);
    if (icon.empty()) {
        return contents;
    }
    std::string cleaned = replaceString(contents, icon, "", true);
    const std::string title = extractString(cleaned, "<text", "</text>", true);
    if (title.empty()) {
        return cleaned;
    }
    cleaned = replaceString(cleaned, title, "", true);
    cleaned = replaceString(cleaned, "<br/>", "", false);
    return replaceString(cleaned, "<br>", "", false);
}
