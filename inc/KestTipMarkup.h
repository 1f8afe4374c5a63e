#pragma once

#include "KestContentInfo.h"

#include <string>

/// What a page writes: its number in the title bar, its title line, its text. Static; holds no state.
class KestTipMarkup {
public:
    /// "3/11" by a translated format, as printf() knows it, for page `number` (from 1) of `count`. At most 255 bytes. A
    /// format that asks for anything else than these two numbers is the text itself.
    static std::string pageNumber(const std::string& translated, int number, int count);
    /// Icon and title, in black.
    static std::string title(const KestContentInfo& record);
    /// Empty when the record has no text.
    static std::string text(const KestContentInfo& record);
};
