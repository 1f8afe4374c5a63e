#pragma once

#include "Tips.h"

#include "kest/KestUiTest.h"
#include "ui/Undrawn.h"

#include <device/Keys.h>

#include <gmock/gmock.h>

#include <optional>
#include <string>
#include <utility>
#include <vector>

/// The running application on a device that changes under it.
class ChangesTest : public KestUiTest {
protected:
    using Language = tips::Language;
    using Names = std::vector<std::string>;
    using Extras = std::vector<std::pair<std::string, std::string>>;

    ChangesTest();

    /// Starts with the extras of that request (KEY=VALUE) and lets the first screen come to rest.
    void begin(const std::vector<std::string>& words = {});
    /// The same, without waiting for anything.
    void beginAtOnce(const std::vector<std::string>& words);
    /// Another launch request, while the application runs.
    void request(const Extras& extras);

    // What changes on the device.
    void setLanguage(Language language) { KestUiTest::setLanguage(tips::setting(language)); }
    void setTheme(const std::string& theme) { device()->settings().set(device::keys::theme, theme); }
    void setCountry(const std::string& code) { device()->settings().set(device::keys::country, code); }
    /// Has the device that application, which it has not had; its tips come with it.
    void install(const std::string& appid);
    /// Installs a later version of an application.
    void update(const std::string& appid);
    /// Tries to install an application whose package cannot be copied.
    void failToInstall(const std::string& appid);
    void uninstall(const std::string& appid) { device()->packages().uninstall(appid); }
    /// Has the main menu file these menus, and those that come and go with applications and countries.
    void writeMenuFile(const Names& names) const;

    // What is to be seen.
    /// "nothing", "list <header>: <first row in sight>" or "page <header>: <title>, <text>".
    std::string top();
    /// How many views the naviframe holds.
    unsigned int levels();
    Evas_Object* list() { return test_ui::widget(running().window(), "Elm_Genlist"); }
    /// The list's rows below its title, each "<title>, <application>". The list must be on the top.
    std::vector<std::string> rows();
    static std::vector<std::string> rowsOf(const Names& names, Language language);
    /// How the page of a tip reads: "page Tips 2/10: Alarm, How to use Alarm".
    static std::string pageOf(const std::string& name, const Names& names, Language language);
    /// The colour (0xRRGGBB) at the right edge of the screen, where only grounds are.
    unsigned int ground(int y);
    /// The picture of a sequence that is in view, counting from 0; -1 without one.
    int pictureInView();

    // What a user does.
    void tapRow(std::size_t menu);
    void swipeToTheNextPage();
    void back();
    void tapLink();
    /// Presses the button that has pictures play again, and lets go of it.
    void reply();

    /// "KT01 Alarm": the usage records since the last call.
    std::vector<std::string> newRecords();
    /// The error lines since the last call: "KestContentMgr.cpp: __loadMainMenu > Empty document".
    std::vector<std::string> newErrors();

private:
    static void writeTip(const tips::Tip& tip, const std::filesystem::path& sharedResources);
    std::filesystem::path packageOf(const std::string& appid, const std::string& version);
    /// The widget of that type on the page in view.
    Evas_Object* onPage(const std::string& type);
    Evas_Object* pictureArea();

    std::optional<test_ui::Undrawn> undrawn_;
    std::size_t recordsRead_ = 0;
    int packages_ = 0;
};
