#include "kest/KestUiTest.h"

#include "KestPaths.h"

#include <app-assist/WWindow.h>
#include <device/Keys.h>

namespace fs = std::filesystem;

KestUiTest::KestUiTest() {
    const fs::path resources = device().appRoot() / "res";
    fs::create_directories(resources / "edje");
    fs::create_symlink(TEST_APP_THEME, resources / "edje/kest.edj");
    fs::create_directory_symlink(TEST_APP_TABLES, resources / "table");
    // What a start binds the application's texts to, and what the application itself does.
    fs::create_directory_symlink(kest_paths::locale, resources / "locale");
    fs::create_symlink(TEST_DEVICE_THEME, device().data() / "device.edj");
}

void KestUiTest::start(const std::vector<std::string>& words) {
    running_.emplace(app_, words);
    settle();
}

app_assist::WNaviframe& KestUiTest::naviframe() {
    return *static_cast<app_assist::WNaviframe*>(app_.getWindow()->getBaseUiObject());
}

std::string KestUiTest::topView() {
    const app_assist::WView* view = naviframe().getTopView();
    return view ? view->getClassName() : "";
}

void KestUiTest::setLanguage(const std::string& language) {
    device()->settings().set(device::keys::language, language);
}

std::vector<kest_log::Line> KestUiTest::newLog() {
    const std::vector<kest_log::Line> lines = kest_log::all(device());
    const std::vector<kest_log::Line> fresh(lines.begin() + static_cast<std::ptrdiff_t>(logRead_), lines.end());
    logRead_ = lines.size();
    return fresh;
}
