#pragma once

#include <string>

namespace device {

/// Whether the text is UTF-8 without a zero byte: what a D-Bus string can carry. (libdbus ends a process that
/// hands it anything else.)
bool isUtf8(const std::string& text);

}  // namespace device
