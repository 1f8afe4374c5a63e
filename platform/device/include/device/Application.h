#pragma once

#include "device/Link.h"

#include <filesystem>
#include <optional>
#include <string>

namespace device {

/// The application that this process runs, as its launcher knows it.
struct Application {
    std::string id;                 ///< for example "com.example.app"
    std::filesystem::path root;     ///< its package's folder, with res/ and shared/res/ below it
    std::optional<Link> link = {};  ///< how links lead into it; none: no link does

    /// Of this process: the package whose bin/ holds the executable.
    /// Throws Error when there is no manifest two folders above the executable.
    static Application ofThisProcess();
};

}  // namespace device
