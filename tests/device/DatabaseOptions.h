#pragma once

#include "device/Device.h"
#include "support/TemporaryDevice.h"

#include <filesystem>
#include <string>
#include <vector>

/// A device in that folder, without packages.
inline device::Device::Options optionsFor(const std::filesystem::path& folder,
                                          device::Database::Check check = device::Database::Check::Quick) {
    return {device::Folder(folder), {}, folder / "data", check};
}

inline std::vector<std::string> filesIn(const std::filesystem::path& folder) {
    std::vector<std::string> names;
    for (const auto& entry : std::filesystem::directory_iterator(folder))
        names.push_back(entry.path().filename().string());
    return names;
}
