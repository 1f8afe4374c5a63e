#include "Colour.h"

#include <charconv>

namespace uxt {
namespace {

std::optional<int> hexByte(std::string_view digits) {
    // A type without a sign, since a minus is no digit here.
    unsigned char value = 0;
    const auto [end, error] = std::from_chars(digits.data(), digits.data() + 2, value, 16);
    if (error != std::errc() || end != digits.data() + 2)
        return std::nullopt;
    return value;
}

}  // namespace

std::optional<Colour> Colour::parse(std::string_view text) {
    if ((text.size() != 7 && text.size() != 9) || text[0] != '#')
        return std::nullopt;
    const auto red = hexByte(text.substr(1));
    const auto green = hexByte(text.substr(3));
    const auto blue = hexByte(text.substr(5));
    const auto alpha = text.size() == 9 ? hexByte(text.substr(7)) : 255;
    if (!red || !green || !blue || !alpha)
        return std::nullopt;
    return Colour{*red, *green, *blue, *alpha};
}

}  // namespace uxt
