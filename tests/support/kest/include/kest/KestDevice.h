#pragma once

#include "kest/CatalogueFiles.h"
#include "kest/LogLines.h"
#include "support/TemporaryDevice.h"

#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <vector>

/// The device of a test of the application: fresh, with the application's package on it, whose catalogue the test
/// writes. ctest runs each test in a process of its own, since the catalogue manager is one a process.
class KestDevice {
public:
    inline static const std::string kest = "com.ravella.kest";
    inline static const std::string tipPath = "contents/tip.xml";

    KestDevice();
    KestDevice(const KestDevice&) = delete;
    KestDevice& operator=(const KestDevice&) = delete;

    support::TemporaryDevice& device() const { return *kept(); }

    /// The shared resources of an application.
    std::filesystem::path resources(const std::string& appid = kest) const {
        return device().preinstalled() / appid / "shared/res";
    }
    std::filesystem::path mainMenuFile() const { return resources() / "contents/kest_menu.xml"; }

    /// An application that the device has, beside the one that is tested.
    void addApplication(const std::string& appid) const { device().addPackage(appid); }
    /// Gives the application's package another version, as an upgrade does.
    void upgradeTo(const std::string& version) const { device().addPackage(kest, version); }

    void writeMenus(const std::vector<kest_files::Menu>& menus) const;
    void writeDetail(const std::string& item, const std::string& path = tipPath, const std::string& appid = kest) const;
    void writeStrings(const std::vector<kest_files::String>& strings,
                      const std::string& path = "contents/tip-string.xml", const std::string& appid = kest) const;
    /// A menu of Kest's own at tipPath with that detail.
    void writeTip(const std::string& item) const;

    /// A preference of the application's.
    std::optional<std::string> preference(const std::string& key) const {
        return device()->preferences().get(kest, key);
    }
    void setPreference(const std::string& key, const std::string& value) const {
        device()->preferences().set(kest, key, value);
    }

private:
    /// The last device stays until the process ends, since the manager writes a last line to its log then.
    static std::unique_ptr<support::TemporaryDevice>& kept();
};
