#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace device {

/// One kind of display that a device can have.
struct Screen {
    std::string name;  ///< "720x1280"; also the value of keys::screen
    int width;         ///< pixels
    int height;        ///< pixels
    double scale;      ///< the toolkit's scale on this display
    /// Folder of the resources of this density, below an application's res/ ("" for the default density).
    std::string resourceFolder;

    /// Every profile, the default one first.
    static const std::vector<Screen>& all();
    /// The profile of that name; the default one for an unknown name.
    static const Screen& named(std::string_view name);
};

}  // namespace device
