#pragma once

#include "KestContentMgr.h"

#include "kest/CatalogueFiles.h"
#include "kest/LogLines.h"
#include "kest/Texts.h"
#include "support/TemporaryDevice.h"

#include <device/Keys.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>
#include <optional>
#include <string>
#include <vector>

/// A catalogue on a device of the test's own. The manager is one a process, so ctest runs each test in a process.
class CatalogueTest : public testing::Test {
protected:
    inline static const std::string kest = "com.ravella.kest";
    inline static const std::string tipPath = "contents/tip.xml";

    /// `withManager` false: the test is the first to ask for the manager. Otherwise it stands, with no catalogue so
    /// far.
    explicit CatalogueTest(bool withManager = true);

    support::TemporaryDevice& device() const { return *kept(); }

    /// The shared resources of an application.
    std::filesystem::path resources(const std::string& appid = kest) const {
        return device().preinstalled() / appid / "shared/res";
    }
    std::filesystem::path mainMenuFile() const { return resources() / "contents/kest_menu.xml"; }

    void setLanguage(const std::string& language);
    void setCountry(const std::string& country);
    /// An application that the device has, beside the one that is tested.
    void addApplication(const std::string& appid) { device().addPackage(appid); }
    /// Gives the application's package another version, as an upgrade does.
    void upgradeTo(const std::string& version) { device().addPackage(kest, version); }

    void writeMenus(const std::vector<kest_files::Menu>& menus);
    void writeDetail(const std::string& item, const std::string& path = tipPath, const std::string& appid = kest);
    void writeStrings(const std::vector<kest_files::String>& strings,
                      const std::string& path = "contents/tip-string.xml", const std::string& appid = kest);
    /// A menu of Kest's own at tipPath with that detail.
    void writeTip(const std::string& item);

    /// Loads the catalogue and returns what it holds; `force` false takes the cached path where that is valid.
    std::vector<KestContentInfo> load(bool force = true);
    /// Loads writeTip(item) and returns its record.
    KestContentInfo loadTip(const std::string& item);
    /// What contents become, in a tip whose title has no id.
    std::string loadContents(const std::string& markup) { return loadTip(kest_files::contents(markup)).textContents; }

    /// What the last load returned.
    bool result() const { return result_; }
    /// The application's lines in the log of the last load.
    const std::vector<kest_log::Line>& log() const { return log_; }
    std::vector<kest_log::Line> errors() const { return kest_log::ofLevel('E', log_); }
    std::vector<kest_log::Line> warnings() const { return kest_log::ofLevel('W', log_); }

    /// A preference of the application's.
    std::optional<std::string> preference(const std::string& key) const {
        return device()->preferences().get(kest, key);
    }
    void setPreference(const std::string& key, const std::string& value) {
        device()->preferences().set(kest, key, value);
    }

    /// Titles in the order of the records.
    static std::vector<std::string> titles(const std::vector<KestContentInfo>& records);
    static std::vector<std::string> paths(const std::vector<KestContentInfo>& records);

private:
    /// The last device stays until the process ends, since the manager writes a last line to its log then.
    static std::unique_ptr<support::TemporaryDevice>& kept();

    bool result_ = false;
    std::vector<kest_log::Line> log_;
};

/// Lines of the catalogue manager's source file.
namespace manager_log {

inline constexpr char file[] = "KestContentMgr.cpp";
inline kest_log::Line begin(const std::string& function) {
    return kest_log::begin(file, function);
}
inline kest_log::Line hit(const std::string& function) {
    return kest_log::hit(file, function);
}
inline kest_log::Line info(const std::string& function, const std::string& message) {
    return kest_log::info(file, function, message);
}
inline kest_log::Line warning(const std::string& function, const std::string& message) {
    return kest_log::warning(file, function, message);
}
inline kest_log::Line error(const std::string& function, const std::string& message) {
    return kest_log::error(file, function, message);
}

}  // namespace manager_log
