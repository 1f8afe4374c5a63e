#pragma once

#include "device/Packages.h"
#include "support/TemporaryDevice.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

inline std::vector<std::string> idsOf(const std::vector<device::Package>& packages) {
    std::vector<std::string> ids;
    ids.reserve(packages.size());
    for (const device::Package& package : packages)
        ids.push_back(package.id);
    return ids;
}

/// A device with one package of the build's, "com.example.app", and others to install.
class InstalledPackages : public testing::Test {
protected:
    std::filesystem::path makePackage(const std::string& id, const std::string& version = "1.0.0") const {
        return support::TemporaryDevice::makePackage(device.folder() / "elsewhere" / (id + version), id, version);
    }
    /// What lies beside the installed packages, hidden.
    std::vector<std::string> remains() const {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(device.root() / "opt/usr/apps"))
            if (entry.is_directory() && entry.path().filename().string().starts_with('.'))
                names.push_back(entry.path().filename().string());
        return names;
    }

    support::TemporaryDevice device{"com.example.app", "3.0"};
    device::Packages& packages = device->packages();
};
