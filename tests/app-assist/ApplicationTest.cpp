#include "TellingApp.h"
#include "Toolkit.h"

#include "support/Environment.h"
#include "support/TemporaryDevice.h"
#include "ui/RunningApp.h"
#include "ui/UiTest.h"

#include <app-assist/WWindow.h>
#include <device/Keys.h>
#include <gmock/gmock.h>
#include <libintl.h>

#include <cstdlib>
#include <utility>

using app_assist::WApp;
using test_ui::RunningApp;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

class Application : public test_ui::UiTest {
protected:
    void set(const char* key, const char* value) { device_->settings().set(key, value); }

    support::TemporaryDevice device_;
    TellingApp app_;
};

TEST_F(Application, LivesInOrder) {
    {
        RunningApp running(app_, {"appID=com.example.other", "page=2", "text=a=b"});
        EXPECT_EQ(std::nullopt, running.status());
        EXPECT_THAT(std::exchange(app_.story, {}), ElementsAre("onStart 4 text=a=b", "onCreate"));
        test_ui::runFor(1.0);
        EXPECT_THAT(
            std::exchange(app_.story, {}),
            ElementsAre("onAppControl com.example.app first appID=com.example.other page=2 text=a=b", "onResume"));
    }
    EXPECT_THAT(app_.story, ElementsAre("onPause", "onTerminate"));
}

TEST_F(Application, UsesTheFreshDatabaseWhereItsOwnWasSetAsideBeforeItTookItsLock) {
    const std::filesystem::path file = device_->database().file();
    std::filesystem::rename(file, file.string() + ".damaged");
    RunningApp running(app_);
    EXPECT_EQ(std::nullopt, running.status());
    set("db/example/word", "tea");
    EXPECT_FALSE(device_->database().isReplaced());
    EXPECT_EQ("tea", device::Device(device_.options()).settings().get("db/example/word"));
}

TEST_F(Application, IsToldWhenItsWindowIsPutAwayAndComesBack) {
    app_.inCreate = [this] { app_.attachWindow(new app_assist::WWindow("Sample", ELM_WIN_BASIC)); };
    RunningApp running(app_);
    test_ui::runFor(1.0);
    app_.story.clear();
    evas_object_smart_callback_call(running.window(), "iconified", nullptr);
    EXPECT_THAT(std::exchange(app_.story, {}), ElementsAre("onPause"));
    evas_object_smart_callback_call(running.window(), "normal", nullptr);
    EXPECT_THAT(std::exchange(app_.story, {}), ElementsAre("onResume"));
    evas_object_smart_callback_call(running.window(), "iconified", nullptr);
    running.end();
    EXPECT_THAT(app_.story, ElementsAre("onPause", "onTerminate"));
}

TEST_F(Application, AWindowOfTheFrameworksMakingShows) {
    app_.inCreate = [this] { app_.attachWindow(new app_assist::WWindow("Sample", ELM_WIN_BASIC)); };
    RunningApp running(app_);
    test_ui::runFor(1.0);
    EXPECT_TRUE(evas_object_visible_get(running.window()));
}

TEST_F(Application, ItsFirstFrameHasWhatTheFirstRequestAskedFor) {
    app_.inCreate = [this] { app_.attachWindow(new app_assist::WWindow("Sample", ELM_WIN_BASIC)); };
    RunningApp running(app_);
    app_.story.clear();
    const auto tell = [](void* app, Evas*, void*) { static_cast<TellingApp*>(app)->story.emplace_back("frame"); };
    evas_event_callback_add(evas_object_evas_get(running.window()), EVAS_CALLBACK_RENDER_PRE, tell, &app_);
    test_ui::runFor(1.0);
    ASSERT_GE(app_.story.size(), 3U);
    EXPECT_THAT(std::vector(app_.story.begin(), app_.story.begin() + 3),
                ElementsAre("onAppControl com.example.app first", "onResume", "frame"));
    evas_event_callback_del(evas_object_evas_get(running.window()), EVAS_CALLBACK_RENDER_PRE, tell);
}

TEST_F(Application, TheObjectIsTheProcesssForItsLife) {
    EXPECT_EQ(&app_, WApp::getInstance());
    {
        auto other = std::make_unique<TellingApp>();
        EXPECT_EQ(other.get(), WApp::getInstance());
    }
    EXPECT_EQ(nullptr, WApp::getInstance());
}

TEST_F(Application, LeavesNoPreferenceToBeWrittenAfterItsEnd) {
    RunningApp running(app_);
    device_->database().sql().exec("PRAGMA max_page_count = 20");
    EXPECT_ANY_THROW(device_->preferences().setInOrder("com.example.app", "long", std::string(1 << 20, 'x')));
    device_->database().sql().exec("PRAGMA max_page_count = 10000");
    running.end();
    EXPECT_NE(device_->preferences().get("com.example.app", "long"), std::nullopt);
}

TEST_F(Application, MayEndInItsFirstLaunchRequest) {
    app_.inAppControl = [] { elm_exit(); };
    RunningApp running(app_);
    EXPECT_FALSE(test_ui::hasEnded());
    test_ui::runFor(1.0);
    EXPECT_TRUE(test_ui::hasEnded());
}

TEST_F(Application, StartRunsTheMainLoopAndReturnsZero) {
    app_.inAppControl = [] { elm_exit(); };
    char name[] = "app";
    char* argv[] = {name, nullptr};
    EXPECT_EQ(0, app_.start(1, argv));
    EXPECT_THAT(app_.story, ElementsAre("onStart 1 app", "onCreate", "onAppControl com.example.app first", "onResume",
                                        "onPause", "onTerminate"));
}

/// Standard error of the application's start, without the program's name before each line.
class ApplicationStart : public Application {
protected:
    std::string begin(const std::vector<std::string>& words = {}) {
        testing::internal::CaptureStderr();
        RunningApp running(app_, words);
        status_ = running.status();
        std::string said = testing::internal::GetCapturedStderr();
        const std::string program = std::string(program_invocation_short_name) + ": ";
        for (size_t at = 0; (at = said.find(program, at)) != std::string::npos;)
            said.erase(at, program.size());
        return said;
    }
    /// Makes the application one that links lead into.
    void takeLinks() {
        device::Link link("tea:{cup}{?milk}");
        link.restrict("milk", "[0-9]+");
        device_->setApplication({device_.appId(), device_.appRoot(), link});
    }
    std::optional<int> status_;
};

TEST_F(ApplicationStart, SaysOnceThatThereIsNoBus) {
    EXPECT_EQ("there is no bus: remote control is off\n", begin());
    EXPECT_EQ(std::nullopt, status_);
}

TEST_F(ApplicationStart, WithAWordThatIsNoExtraEndsWithStatusTwoBeforeItTouchesAnything) {
    EXPECT_EQ("error: 'hello' is no extra of a launch request: write KEY=VALUE\n", begin({"a=1", "hello"}));
    EXPECT_EQ(2, status_);
    EXPECT_EQ("error: '=1' is no extra of a launch request: write KEY=VALUE\n", begin({"=1"}));
    EXPECT_EQ(2, status_);
    EXPECT_THAT(app_.story, IsEmpty());
}

TEST_F(ApplicationStart, TakesALinkIntoTheApplication) {
    takeLinks();
    for (const char* link : {"tea:green?milk=1", "TEA:green?milk=1"}) {
        RunningApp running(app_, {link});
        EXPECT_EQ(std::nullopt, running.status());
        app_.story.clear();
        test_ui::runFor(1.0);
        EXPECT_THAT(app_.story, ElementsAre("onAppControl com.example.app first cup=green milk=1", "onResume"));
    }
}

TEST_F(ApplicationStart, WithALinkThatLeadsNowhereEndsWithStatusTwo) {
    takeLinks();
    EXPECT_EQ(
        "error: cannot open \"tea:green?milk=x\": its \"milk\" is \"x\", which does not match [0-9]+; such a link is "
        "written tea:{cup}{?milk}\n",
        begin({"tea:green?milk=x"}));
    EXPECT_EQ(2, status_);
    EXPECT_EQ("error: cannot open \"tea:\": its \"cup\" is empty; such a link is written tea:{cup}{?milk}\n",
              begin({"tea:"}));
    EXPECT_EQ(2, status_);
    EXPECT_THAT(app_.story, IsEmpty());
}

TEST_F(ApplicationStart, TakesWhatIsNoLinkOfItsOwnAsExtras) {
    const auto takes = [this](const std::vector<std::string>& words, const std::string& extras) {
        RunningApp running(app_, words);
        app_.story.clear();
        test_ui::runFor(1.0);
        EXPECT_THAT(app_.story, ElementsAre("onAppControl com.example.app first " + extras, "onResume"));
    };
    takes({"tea:green=1"}, "tea:green=1");
    device_->setApplication({device_.appId(), device_.appRoot(), device::Link("tea:{cup}")});
    takes({"coffee:black=1"}, "coffee:black=1");
    takes({"cup=tea:green"}, "cup=tea:green");
    takes({"tea:green=1", "milk=2"}, "milk=2 tea:green=1");
    EXPECT_EQ("error: 'coffee:black' is no extra of a launch request: write KEY=VALUE\n", begin({"coffee:black"}));
    EXPECT_EQ(2, status_);
}

TEST_F(ApplicationStart, ThatTheApplicationRefusesEndsWithStatusOne) {
    app_.creates = false;
    EXPECT_EQ("error: the application could not start\n", begin());
    EXPECT_EQ(1, status_);
    EXPECT_THAT(app_.story, ElementsAre("onStart 1 app", "onCreate"));
}

TEST_F(ApplicationStart, ThatThrowsEndsWithStatusOne) {
    app_.inCreate = [] { throw std::runtime_error("no more room"); };
    EXPECT_EQ("error: no more room\n", begin());
    EXPECT_EQ(1, status_);
}

TEST_F(ApplicationStart, WhoseDatabaseWasReplacedByWhatIsNoneEndsWithStatusOne) {
    const std::filesystem::path file = device_->database().file();
    const support::Environment same("KEST_DEVICE", device_.root().string());
    std::filesystem::rename(file, file.string() + ".damaged");
    std::filesystem::create_directory(file);
    EXPECT_EQ("error: " + file.string() +
                  ": is not a file; move it away, and the device begins with a fresh database\n",
              begin());
    EXPECT_EQ(1, status_);
    EXPECT_THAT(app_.story, IsEmpty());
}

TEST_F(Application, RunsAtTheRootWithItsToolkitsFilesInTheDevice) {
    support::Environment unusable("XDG_RUNTIME_DIR", "/no/such/folder");
    RunningApp running(app_);
    const auto toolkit = device::Folder(device_.root()).toolkit();
    EXPECT_EQ("/", std::filesystem::current_path());
    EXPECT_EQ((toolkit / "config").string(), std::getenv("XDG_CONFIG_HOME"));
    EXPECT_EQ((toolkit / "cache").string(), std::getenv("XDG_CACHE_HOME"));
    EXPECT_EQ((toolkit / "run").string(), std::getenv("XDG_RUNTIME_DIR"));
    EXPECT_EQ(std::filesystem::perms::owner_all, std::filesystem::status(toolkit / "run").permissions());
}

TEST_F(Application, DrawsAPictureInATextThatIsNamedWithTheSlashOfItsPathLeftOut) {
    RunningApp running(app_);
    const unsigned int red = 0xffff0000;
    const auto file = device_.folder() / "icon.png";
    ASSERT_TRUE(test_ui::Picture(1, 1, &red).save(file));
    Evas_Object* entry = elm_entry_add(test_ui::UiTest::window());
    const std::string text = "<item size=62x62 vsize=full href=file:/" + file.string() + "></item>";
    elm_object_text_set(entry, text.c_str());
    evas_object_resize(entry, 720, 200);
    evas_object_show(entry);
    test_ui::runFor(0.5);
    const int side = static_cast<int>(62 * elm_config_scale_get());
    EXPECT_EQ(side * side, test_ui::UiTest::screen().picture().count(0xff0000, {0, 0, 720, 200}));
}

TEST_F(Application, KeepsARunDirectoryThatIsGood) {
    const auto good = device_.folder() / "run";
    std::filesystem::create_directory(good);
    support::Environment environment("XDG_RUNTIME_DIR", good.string());
    RunningApp running(app_);
    EXPECT_EQ(good.string(), std::getenv("XDG_RUNTIME_DIR"));
}

TEST_F(Application, HasTheProfileAndTheScaleOfTheDevicesDisplay) {
    {
        RunningApp running(app_);
        EXPECT_STREQ("mobile", elm_config_profile_get());
        EXPECT_DOUBLE_EQ(2.6, elm_config_scale_get());
    }
    set(device::keys::screen, "480x800");
    device_.reopen();
    RunningApp running(app_);
    EXPECT_DOUBLE_EQ(1.7, elm_config_scale_get());
}

TEST_F(Application, HasTheToolkitsErrorsInTheDevicesLog) {
    char name[] = "app";
    char* argv[] = {name, nullptr};
    const app_assist::Toolkit toolkit(*device_.operator->(), app_assist::Toolkit::Messages::InLog, 1, argv);
    EINA_LOG_CRIT("a widget is broken");
    EINA_LOG_ERR("a widget complains of %d things", 2);
    EINA_LOG_WARN("a widget is worried");
    const std::string log = support::readFile(device_->folder().log());
    EXPECT_THAT(log, testing::ContainsRegex(" E EFL\\([0-9]+\\) : TestBody\\([0-9]+\\) > a widget is broken\n"));
    EXPECT_THAT(log,
                testing::ContainsRegex(" W EFL\\([0-9]+\\) : TestBody\\([0-9]+\\) > a widget complains of 2 things\n"));
    EXPECT_THAT(log, testing::Not(testing::HasSubstr("worried")));
}

TEST_F(Application, FindsItsOwnTextsAndTheDevicesAsSoonAsItIsCreated) {
    int looks = 0;
    app_.inCreate = [&] {
        ++looks;
        EXPECT_STREQ((device_.appRoot() / "res/locale").c_str(), bindtextdomain("app", nullptr));
        EXPECT_STREQ("UTF-8", bind_textdomain_codeset("app", nullptr));
        EXPECT_STREQ((device_.data() / "locale").c_str(), bindtextdomain("sys_string", nullptr));
        EXPECT_STREQ("UTF-8", bind_textdomain_codeset("sys_string", nullptr));
    };
    RunningApp running(app_);
    EXPECT_EQ(1, looks);
}

}  // namespace
