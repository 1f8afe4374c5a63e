#include "TellingApp.h"

#include "support/BusClient.h"
#include "support/PrivateBus.h"
#include "support/TemporaryDevice.h"
#include "ui/RunningApp.h"
#include "ui/UiTest.h"

#include <app-assist/WWindow.h>
#include <device/Bus.h>
#include <gmock/gmock.h>

#include <poll.h>
#include <utility>

using support::BusClient;
using test_ui::RunningApp;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

/// What the application's window was asked for, in order, once the application has it.
std::vector<std::string> asked;
const Evas_Object* watched = nullptr;

void note(const Evas_Object* window, const std::string& call) {
    if (window == watched)
        asked.push_back(call);
}

}  // namespace

extern "C" {

void __real_elm_win_activate(Evas_Object* window);
void __wrap_elm_win_activate(Evas_Object* window) {
    note(window, "activate");
    __real_elm_win_activate(window);
}

void __real_elm_win_iconified_set(Evas_Object* window, Eina_Bool iconified);
void __wrap_elm_win_iconified_set(Evas_Object* window, Eina_Bool iconified) {
    note(window, iconified ? "put away" : "bring back");
    __real_elm_win_iconified_set(window, iconified);
}

void __real_elm_win_raise(Evas_Object* window);
void __wrap_elm_win_raise(Evas_Object* window) {
    note(window, "raise");
    __real_elm_win_raise(window);
}

}  // extern "C"

namespace {

class WindowAtARequest : public test_ui::UiTest {
protected:
    WindowAtARequest() {
        app_.inCreate = [this] {
            app_.attachWindow(new app_assist::WWindow("Sample", ELM_WIN_BASIC));
            watched = app_.getWindow()->getEvasObj();
        };
    }
    ~WindowAtARequest() override {
        watched = nullptr;
        asked.clear();
    }

    void launch() { send(device::bus::applicationInterface, "Launch", {BusClient::texts({{"page", "2"}})}); }
    void send(const char* interface, const char* method, const std::vector<BusClient::Argument>& arguments) {
        client_.send({device_.appId(), device::bus::pathOf(device_.appId()), interface}, method, arguments);
        client_.call({"org.freedesktop.DBus", "/org/freedesktop/DBus", "org.freedesktop.DBus"}, "GetId");
        poll(nullptr, 0, 50);
        test_ui::runFor(1.0);
    }

    support::PrivateBus daemon_;
    support::TemporaryDevice device_;
    TellingApp app_;
    BusClient client_{daemon_.address()};
};

TEST_F(WindowAtARequest, ComesToTheFrontForEveryLaterOne) {
    RunningApp running(app_);
    test_ui::runFor(1.0);
    ASSERT_EQ(watched, running.window());
    asked.clear();
    launch();
    EXPECT_THAT(std::exchange(asked, {}), ElementsAre("bring back", "raise", "activate"));
    launch();
    EXPECT_THAT(asked, ElementsAre("bring back", "raise", "activate"));
}

TEST_F(WindowAtARequest, ComesToTheFrontForADesktopsRequestToo) {
    device_->setApplication({device_.appId(), device_.appRoot(), device::Link("tea:{cup}")});
    RunningApp running(app_);
    test_ui::runFor(1.0);
    asked.clear();
    const BusClient::Argument noData = BusClient::nothing("{sv}");
    send("org.freedesktop.Application", "Activate", {noData});
    EXPECT_THAT(std::exchange(asked, {}), ElementsAre("bring back", "raise", "activate"));
    send("org.freedesktop.Application", "Open", {BusClient::list({"tea:green"}), noData});
    EXPECT_THAT(asked, ElementsAre("bring back", "raise", "activate"));
}

TEST_F(WindowAtARequest, IsWhereItIsForTheFirstOneThatItWasStartedWith) {
    RunningApp running(app_);
    ASSERT_EQ(watched, running.window());
    test_ui::runFor(1.0);
    ASSERT_FALSE(app_.story.empty());
    EXPECT_THAT(asked, IsEmpty());
}

TEST_F(WindowAtARequest, ComesToTheFrontForTheFirstOneThatTheBusBrings) {
    RunningApp running(app_, {"--dbus-activated"});
    test_ui::runFor(1.0);
    launch();
    EXPECT_THAT(app_.story, testing::Contains("onAppControl com.example.app first page=2"));
    EXPECT_THAT(asked, ElementsAre("bring back", "raise", "activate"));
}

}  // namespace
