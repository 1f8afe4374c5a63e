#pragma once

#include "Colour.h"

#include <map>
#include <string>

namespace uxt {

/// A colour for each colour class.
using Colours = std::map<std::string, Colour>;

/// What a text class is written in. A size below zero is a percentage of the size that the theme file gives.
struct Font {
    std::string name;
    int size = 0;

    bool operator==(const Font&) const = default;
};

/// A font for each text class.
using Fonts = std::map<std::string, Font>;

}  // namespace uxt

/// A colour table as an application holds it.
struct uxt_color_table {
    uxt::Colours light;
    uxt::Colours dark;

    const uxt::Colours& of(bool isDark) const { return isDark ? dark : light; }
};

/// A font table as an application holds it.
struct uxt_font_table {
    uxt::Fonts fonts;
};

namespace uxt {

/// Both throw TableError when the file cannot be read or is no such table.
uxt_color_table readColorTable(const std::string& file);
uxt_font_table readFontTable(const std::string& file);

}  // namespace uxt
