#pragma once

#include "Tables.h"

#include <string>

namespace uxt {

/// The colours of the device's own widget styles, read from their theme file: its colour classes are the light ones,
/// its data items "dark:<class>" the dark ones.
struct DeviceColours {
    Colours light;
    Colours dark;

    const Colours& of(bool isDark) const { return isDark ? dark : light; }

    /// Throws std::runtime_error, with the file's name, when it is no theme file or a dark colour is missing.
    static DeviceColours read(const std::string& themeFile);
};

}  // namespace uxt
