#pragma once

#include "device/Packages.h"

#include <chrono>
#include <filesystem>
#include <map>
#include <sys/types.h>

namespace device {

/// Manifests that were read before, so that one is parsed again only when its file has changed.
class ManifestMemory {
public:
    /// As readManifest(); a manifest that is broken is not remembered.
    Package read(const std::filesystem::path& root);

private:
    /// Another after every change of the file.
    struct Version {
        dev_t device = 0;
        ino_t inode = 0;
        off_t size = 0;
        std::chrono::nanoseconds statusChange{};
        bool operator==(const Version&) const = default;
    };
    struct Known {
        Version version;
        Package package;
    };

    std::map<std::filesystem::path, Known> known_;
};

}  // namespace device
