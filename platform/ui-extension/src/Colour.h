#pragma once

#include <optional>
#include <string_view>

namespace uxt {

/// A colour with straight alpha, each part from 0 to 255.
struct Colour {
    int red = 0;
    int green = 0;
    int blue = 0;
    int alpha = 255;

    /// Reads "#RRGGBB" or "#RRGGBBAA"; nothing for any other text.
    static std::optional<Colour> parse(std::string_view text);

    bool operator==(const Colour&) const = default;
};

}  // namespace uxt
