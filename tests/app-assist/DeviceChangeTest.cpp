#include "TellingApp.h"

#include "support/TemporaryDevice.h"
#include "ui/RunningApp.h"
#include "ui/UiTest.h"

#include <app-assist/WAppEventHandler.h>
#include <device/Keys.h>
#include <gmock/gmock.h>
#include <ui_extension.h>

#include <locale.h>

using app_assist::WAppEventHandler;
using test_ui::RunningApp;
using testing::ElementsAre;

namespace {

using Story = std::vector<std::string>;

/// gettext's language of this process.
std::string languageOfTexts() {
    const char* language = std::getenv("LANGUAGE");
    return language ? language : "none";
}

/// What an application hears of its device's changes.
class DeviceChange : public test_ui::UiTest {
protected:
    void set(const char* key, const char* value) { device_->settings().set(key, value); }
    /// As another process does of which this one hears nothing.
    void setUnheard(const char* key, const char* value) {
        device::Device other(device_.options());
        other.settings().set(key, value);
    }

    support::TemporaryDevice device_;
    TellingApp app_;
};

TEST_F(DeviceChange, SpeaksTheDevicesLanguageBeforeItIsCreated) {
    set(device::keys::language, "ru_RU.UTF-8");
    std::string language;
    app_.inCreate = [&] { language = languageOfTexts(); };
    RunningApp running(app_);
    EXPECT_EQ("ru_RU", language);
    EXPECT_STRNE("C", setlocale(LC_MESSAGES, nullptr));
}

TEST_F(DeviceChange, ALanguageChangeReachesTheLocaleFirstAndThenTheHandlers) {
    WAppEventHandler handler;
    Story languages;
    handler.addEventHandler(
        APP_EVENT_LANGUAGE_CHANGED,
        [&](app_event_info_h info, void* userData) {
            EXPECT_NE(nullptr, info);
            EXPECT_EQ(&app_, userData);
            languages.push_back(languageOfTexts());
        },
        &app_);
    handler.addEventHandler(
        APP_EVENT_REGION_FORMAT_CHANGED, [](app_event_info_h, void*) { FAIL(); }, nullptr);
    handler.addEventHandler(APP_EVENT_LANGUAGE_CHANGED, nullptr, nullptr);
    RunningApp running(app_);
    set(device::keys::language, "ko_KR.UTF-8");
    set(device::keys::country, "IN");
    EXPECT_THAT(languages, ElementsAre("ko_KR"));
}

TEST_F(DeviceChange, WhileTheApplicationStartsIsCaughtUpWith) {
    Story changes;
    WAppEventHandler handler;
    handler.addEventHandler(
        APP_EVENT_LANGUAGE_CHANGED, [&](app_event_info_h, void*) { changes.push_back(languageOfTexts()); }, nullptr);
    const uxt_theme_changed_cb tell = [](void* data) { static_cast<Story*>(data)->push_back("theme"); };
    uxt_theme_add_changed_callback(nullptr, tell, &changes);
    app_.inCreate = [this] {
        setUnheard(device::keys::language, "ko_KR.UTF-8");
        setUnheard(device::keys::theme, "dark");
    };
    app_.inAppControl = [&changes] { changes.push_back("request"); };
    RunningApp running(app_);
    test_ui::runFor(0.1);
    EXPECT_THAT(changes, ElementsAre("ko_KR", "theme", "request"));
    uxt_theme_delete_changed_callback(nullptr, tell);
}

TEST_F(DeviceChange, ThatWasNoneIsNotToldOf) {
    WAppEventHandler handler;
    handler.addEventHandler(
        APP_EVENT_LANGUAGE_CHANGED, [](app_event_info_h, void*) { FAIL(); }, nullptr);
    const uxt_theme_changed_cb never = [](void*) { FAIL(); };
    uxt_theme_add_changed_callback(nullptr, never, nullptr);
    set(device::keys::language, "ko_KR.UTF-8");
    set(device::keys::theme, "dark");
    RunningApp running(app_);
    test_ui::runFor(0.1);
    EXPECT_EQ("ko_KR", languageOfTexts());
    uxt_theme_delete_changed_callback(nullptr, never);
}

TEST_F(DeviceChange, MirrorsWidgetsFromTheStartWhereTheLanguageIsReadFromTheRight) {
    set(device::keys::language, "ar_EG.UTF-8");
    bool mirrored = false;
    app_.inCreate = [&] { mirrored = elm_config_mirrored_get(); };
    RunningApp running(app_);
    EXPECT_TRUE(mirrored);
}

TEST_F(DeviceChange, MirrorsWidgetsBeforeTheHandlersOfALanguageChange) {
    WAppEventHandler handler;
    Story widgets;
    RunningApp running(app_);
    Evas_Object* label = elm_label_add(test_ui::UiTest::window());
    handler.addEventHandler(
        APP_EVENT_LANGUAGE_CHANGED,
        [&](app_event_info_h, void*) {
            widgets.emplace_back(elm_object_mirrored_get(label) ? "from the right" : "from the left");
        },
        nullptr);
    set(device::keys::language, "ar_EG.UTF-8");
    set(device::keys::language, "he_IL.UTF-8");
    set(device::keys::language, "ko_KR.UTF-8");
    EXPECT_THAT(widgets, ElementsAre("from the right", "from the right", "from the left"));
}

TEST_F(DeviceChange, AHandlerMayDestroyItselfAndOthersWhileItRuns) {
    auto first = std::make_unique<WAppEventHandler>();
    auto second = std::make_unique<WAppEventHandler>();
    int calls = 0;
    first->addEventHandler(
        APP_EVENT_LANGUAGE_CHANGED,
        [&](app_event_info_h, void*) {
            first.reset();
            second.reset();
            ++calls;
        },
        nullptr);
    second->addEventHandler(
        APP_EVENT_LANGUAGE_CHANGED, [](app_event_info_h, void*) { FAIL(); }, nullptr);
    RunningApp running(app_);
    set(device::keys::language, "ko_KR.UTF-8");
    set(device::keys::language, "ru_RU.UTF-8");
    EXPECT_EQ(1, calls);
}

TEST_F(DeviceChange, AnExceptionInAHandlerStaysOutOfEflAndOfTheOthersWay) {
    WAppEventHandler handler;
    int calls = 0;
    handler.addEventHandler(
        APP_EVENT_LANGUAGE_CHANGED, [](app_event_info_h, void*) { throw std::runtime_error("no more room"); }, nullptr);
    handler.addEventHandler(
        APP_EVENT_LANGUAGE_CHANGED, [&](app_event_info_h, void*) { ++calls; }, nullptr);
    RunningApp running(app_);
    set(device::keys::language, "ko_KR.UTF-8");
    EXPECT_EQ(1, calls);
    EXPECT_THAT(device_.logMessages(), testing::Contains("E APP_ASSIST an event handler failed: no more room"));
}

TEST_F(DeviceChange, AThemeChangeReachesTheThemeCallbacks) {
    RunningApp running(app_);
    int calls = 0;
    const uxt_theme_changed_cb count = [](void* data) { ++*static_cast<int*>(data); };
    uxt_theme_add_changed_callback(nullptr, count, &calls);
    set(device::keys::theme, "dark");
    EXPECT_EQ(1, calls);
    set(device::keys::language, "ko_KR.UTF-8");
    EXPECT_EQ(1, calls);
    uxt_theme_delete_changed_callback(nullptr, count);
}

TEST_F(DeviceChange, HearsOfNothingAfterItsEnd) {
    WAppEventHandler handler;
    int calls = 0;
    handler.addEventHandler(
        APP_EVENT_LANGUAGE_CHANGED, [&](app_event_info_h, void*) { ++calls; }, nullptr);
    RunningApp running(app_);
    running.end();
    set(device::keys::language, "ko_KR.UTF-8");
    EXPECT_EQ(0, calls);
}

}  // namespace
