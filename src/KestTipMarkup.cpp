#include "KestTipMarkup.h"

#include <array>

namespace {

const size_t longestPageNumber = 255;

/// What a translation may ask for, and which number it means; -1: the next one.
struct Placeholder {
    const char* text;
    int index;
};
const std::array<Placeholder, 3> placeholders = {{{"%d", -1}, {"%1$d", 0}, {"%2$d", 1}}};

/// The placeholder that stands at that place; null when none does.
const Placeholder* placeholderAt(const std::string& format, size_t at) {
    for (const Placeholder& known : placeholders) {
        if (format.compare(at, std::string(known.text).size(), known.text) == 0) {
            return &known;
        }
    }
    return nullptr;
}

/// As printf() would, but for nothing else than two numbers. False where the format asks for more.
bool writeNumbers(const std::string& format, const std::array<int, 2>& numbers, std::string& text) {
    size_t next = 0;
    for (size_t at = 0; at < format.size();) {
        if (format.compare(at, 2, "%%") == 0 || format[at] != '%') {
            text += format[at];
            at += format[at] == '%' ? 2 : 1;
            continue;
        }
        const Placeholder* placeholder = placeholderAt(format, at);
        if (!placeholder) {
            return false;
        }
        const size_t index = placeholder->index < 0 ? next++ : static_cast<size_t>(placeholder->index);
        if (index >= numbers.size()) {
            return false;
        }
        text += std::to_string(numbers.at(index));
        at += std::string(placeholder->text).size();
    }
    return true;
}

}  // namespace

std::string KestTipMarkup::pageNumber(const std::string& translated, int number, int count) {
    std::string text;
    if (!writeNumbers(translated, {{number, count}}, text)) {
        text = translated;
    }
    return text.substr(0, longestPageNumber);
}

std::string KestTipMarkup::title(const KestContentInfo& record) {
    return "<align=center><item size=62x62 vsize=full href=file:/" + record.iconPath +
           "></item>  <color=#000000><font_weight='Regular'><font_width='condensed'><font_size=46>" + record.menuTitle +
           "</font_size></font_width></font_weight></color></align>";
}

std::string KestTipMarkup::text(const KestContentInfo& record) {
    if (record.textContents.empty()) {
        return "";
    }
    return "<font_style='Regular' font_size=36 align=left linegap=10>" + record.textContents + "</>";
}
