#pragma once

#include <cstddef>
#include <string>

namespace device {

/// The text on one line, for people: control characters become blanks, and what is longer than `longest` bytes ends in
/// "..." after a whole character.
std::string oneLine(const std::string& text, std::size_t longest = 200);

}  // namespace device
