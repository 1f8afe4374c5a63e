#include "device/OneLine.h"

#include <algorithm>

namespace device {
namespace {

bool isWithinCharacter(char byte) {
    return (static_cast<unsigned char>(byte) & 0xC0) == 0x80;
}

bool isControl(char byte) {
    const auto code = static_cast<unsigned char>(byte);
    return code < ' ' || code == 0x7f;
}

}  // namespace

std::string oneLine(const std::string& text, std::size_t longest) {
    std::string line = text.substr(0, longest);
    if (line.size() < text.size()) {
        std::size_t end = line.size();
        while (end > 0 && isWithinCharacter(text[end]))
            --end;
        line = line.substr(0, end) + "...";
    }
    std::replace_if(line.begin(), line.end(), isControl, ' ');
    return line;
}

}  // namespace device
