#include "Utf8.h"

#include <dbus/dbus.h>

namespace device {

bool isUtf8(const std::string& text) {
    return text.find('\0') == std::string::npos && dbus_validate_utf8(text.c_str(), nullptr) != 0;
}

}  // namespace device
