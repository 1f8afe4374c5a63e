#pragma once

#include "KestContentMgr.h"

#include "kest/KestDevice.h"
#include "kest/Texts.h"

#include <device/Keys.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

/// A catalogue on a device of the test's own, without anything drawn.
class CatalogueTest : public testing::Test, protected KestDevice {
protected:
    /// `withManager` false: the test is the first to ask for the manager. Otherwise it stands, with no catalogue so
    /// far.
    explicit CatalogueTest(bool withManager = true);

    void setLanguage(const std::string& language);
    void setCountry(const std::string& country);

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

    /// Titles in the order of the records.
    static std::vector<std::string> titles(const std::vector<KestContentInfo>& records);
    static std::vector<std::string> paths(const std::vector<KestContentInfo>& records);

private:
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
