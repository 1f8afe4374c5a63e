#include "Tables.h"

#include "TableFile.h"

#include <charconv>
#include <optional>

namespace uxt {
namespace {

constexpr int largestSize = 999;

Colour colourOf(const std::string& file, const TableEntry& entry, const std::string& attribute) {
    const std::string& text = entry.values.at(attribute);
    if (const auto colour = Colour::parse(text))
        return *colour;
    throw TableError(file, entry.line, "\"" + text + "\" is no colour; write #RRGGBB or #RRGGBBAA");
}

int sizeOf(const std::string& file, const TableEntry& entry) {
    const std::string& text = entry.values.at("size");
    const bool isPercent = text.ends_with('%');
    const char* end = text.data() + text.size() - (isPercent ? 1 : 0);
    int size = 0;
    const auto [stop, error] = std::from_chars(text.data(), end, size);
    if (error != std::errc() || stop != end || size < 1 || size > largestSize)
        throw TableError(file, entry.line,
                         "\"" + text + "\" is no font size; write pixels from 1 to 999, or a percentage such as 120%");
    return isPercent ? -size : size;
}

}  // namespace

uxt_color_table readColorTable(const std::string& file) {
    uxt_color_table table;
    for (const TableEntry& entry : readTableFile(file, {"color_table", "color", {"class", "light", "dark"}})) {
        const std::string& name = entry.values.at("class");
        table.light[name] = colourOf(file, entry, "light");
        table.dark[name] = colourOf(file, entry, "dark");
    }
    return table;
}

uxt_font_table readFontTable(const std::string& file) {
    uxt_font_table table;
    for (const TableEntry& entry : readTableFile(file, {"font_table", "font", {"class", "font", "size"}}))
        table.fonts[entry.values.at("class")] = {entry.values.at("font"), sizeOf(file, entry)};
    return table;
}

}  // namespace uxt
