#include "PlainLine.h"

#include <Eina.h>

namespace {

constexpr int mostCharacters = 200;
constexpr char replacement[] = "\xEF\xBF\xBD";
constexpr char ellipsis[] = "\xE2\x80\xA6";

/// A byte that belongs to no character comes as a half of a surrogate pair, and such a half is none either.
bool isNoCharacter(Eina_Unicode character) {
    return (character >= 0xD800 && character <= 0xDFFF) || character > 0x10FFFF;
}

bool isControl(Eina_Unicode character) {
    return character < 0x20 || (character >= 0x7F && character < 0xA0) || character == 0x2028 || character == 0x2029;
}

}  // namespace

std::string plainLine(const std::string& text) {
    std::string line;
    int at = 0;
    for (int count = 0;; ++count) {
        const int begin = at;
        const Eina_Unicode character = eina_unicode_utf8_next_get(text.c_str(), &at);
        if (character == 0)
            return line;
        if (count == mostCharacters)
            return line + ellipsis;
        if (isNoCharacter(character))
            line += replacement;
        else if (isControl(character))
            line += ' ';
        else
            line.append(text, static_cast<std::size_t>(begin), static_cast<std::size_t>(at - begin));
    }
}
