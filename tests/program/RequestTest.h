#pragma once

#include "ProgramTest.h"

#include "support/BusClient.h"
#include "support/TemporaryFolder.h"

#include <device/Bus.h>

#include <string>
#include <vector>

/// Asks the application for something from outside, and looks at what it shows and records.
class RequestTest : public ProgramTest {
protected:
    static constexpr char clockId[] = "com.ravella.clock";
    static constexpr char clockTip[] = "appID=com.ravella.clock";
    static constexpr char settingsTip[] = "appID=com.ravella.settings";
    static constexpr char postNotification[] = "LaunchingType=addNoti";

    const int clockMenu_ = menuOf("contents/clock_faces.xml");
    const int settingsMenu_ = menuOf("contents/settings_palm.xml");
    const int heartrateMenu_ = menuOf("contents/heartrate_measure.xml");
    const int exerciseMenu_ = menuOf("contents/exercise_walk.xml");

    test_tool::Result launch(const std::vector<std::string>& extras = {}) {
        std::vector<std::string> words{"launch", app, "--headless"};
        words.insert(words.end(), extras.begin(), extras.end());
        return device_.run(words);
    }
    /// That the application is started for it.
    void launchCold(const std::vector<std::string>& extras = {}) {
        const test_tool::Result result = launch(extras);
        EXPECT_EQ(result, test_tool::done("com.ravella.kest runs, headless (process " +
                                          std::to_string(device_.application()) + ")\n"));
    }
    test_tool::Result handedOver() {
        return test_tool::done("com.ravella.kest has the request (process " + std::to_string(device_.application()) +
                               ")\n");
    }

    /// The classes of the views that stand on each other, the lowest first.
    std::vector<std::string> views();
    /// The usage records, as "KT03 a tip's title".
    std::vector<std::string> records();
    /// That of a request for the tip of the menu, counting from 0, while the list is in sight.
    std::string recordInSight(int menu) { return "KT03 " + titles()[static_cast<std::size_t>(menu)]; }
    /// That the tip of the menu shows, counting from 0, with nothing but the list beneath, after one request for it;
    /// and that back leads to the list and out. The application has ended then.
    void expectTipAboveTheList(int menu);
    /// Of which menu the page in view is, counting from 0; -1 when there is none in sight.
    int pageInView();

    static support::BusClient::Target target(const std::string& interface = device::bus::applicationInterface) {
        return {app, device::bus::pathOf(app), interface};
    }
};

/// The application runs and shows its list.
class WarmRequestTest : public RequestTest {
protected:
    void SetUp() override {
        start();
        titles_ = titles();
    }
    std::string recordOf(int menu) const { return "KT03 " + titles_[static_cast<std::size_t>(menu)]; }
    /// Of the device's own bus.
    std::string address() const {
        const std::string text = support::readFile(device_.root() / "bus.address");
        return text.substr(0, text.find('\n'));
    }

    std::vector<std::string> titles_;
};
