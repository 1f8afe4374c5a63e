#pragma once

#include "TestDevice.h"

#include <gmock/gmock.h>

#include <string>
#include <vector>

/// A row of the list as a person sees it.
struct ListRow {
    std::string top;     ///< the application's name
    std::string bottom;  ///< the tip's title
    bool hasIcon = false;
};

/// Runs the tips application on a device of the test's own and looks at it through kest-device.
class ProgramTest : public testing::Test {
protected:
    static constexpr char app[] = "com.ravella.kest";

    void start() { device_.must({"start", "--headless"}); }
    void restart() {
        device_.must({"stop"});
        start();
    }

    /// The list's element in the tree; null when there is none in sight.
    nlohmann::json list();
    /// The text of the title row.
    std::string titleRow();
    /// The rows below the title row.
    std::vector<ListRow> rows();
    /// Their titles.
    std::vector<std::string> titles();
    /// The text of the title bar.
    std::string titleBar();
    /// The messages of the application's log lines that hold `text`, each with its level: "I message".
    std::vector<std::string> logged(const std::string& text);
    bool holds(const std::string& condition) {
        return device_.run({"wait-for", condition, "--timeout", "0"}).status == 0;
    }

    test_tool::TestDevice device_;
};

/// The detail files of the menus that the shipped catalogue offers in a region and whose application is installed.
std::vector<std::string> menusOfferedIn(const std::string& region);
/// The place of a detail file among them, counting from 0; their number when it is not there.
int menuOf(const std::string& file, const std::string& region = "Global");

/// A package of the application com.ravella.sleep, which no device has from the start but the catalogue has a tip
/// about. Its title is "Sleep tight".
std::filesystem::path makeSleepPackage(const std::filesystem::path& where);
