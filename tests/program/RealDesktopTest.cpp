#include "RealDesktop.h"
#include "ProgramTest.h"

using test_tool::done;
using testing::IsEmpty;

namespace {

/// The invitation as a person finds it on a desktop: shown by a daemon that knows nothing of the device, and clicked
/// with the mouse.
class InvitationOnARealDesktop : public ProgramTest {
protected:
    static constexpr char daemonsWindow[] = "Dunst";

    void SetUp() override {
        if (const auto missing = RealDesktop::missing())
            GTEST_SKIP() << *missing << " is not installed; xvfb, openbox, dunst and xdotool have to be";
        desktop_.emplace();
        device_.setEnvironment("DISPLAY", desktop_->display());
        device_.setEnvironment("DBUS_SESSION_BUS_ADDRESS", desktop_->address());
    }
    void TearDown() override {
        // Before the desktop goes, whose end is not what this is about.
        device_.run({"stop"});
    }

    std::optional<RealDesktop> desktop_;
};

}  // namespace

TEST_F(InvitationOnARealDesktop, OpensTheListInAWindowWhenItIsClicked) {
    EXPECT_EQ(device_.run({"launch", app, "LaunchingType=addNoti"}),
              done("com.ravella.kest was started and ended by itself\n"));
    ASSERT_TRUE(desktop_->showsWindow(daemonsWindow));
    EXPECT_EQ(device_.run({"wait-for", "log=notification 1: shown on the desktop"}), done());

    desktop_->clickWindow(daemonsWindow);

    EXPECT_EQ(device_.run({"wait-for", "text=Tips", "--app", app}), done());
    EXPECT_FALSE(rows().empty());
    EXPECT_EQ(device_.run({"wait-for", "log=notification 1: clicked"}), done());
    EXPECT_THAT(device_.json({"notifications"}), IsEmpty());
    EXPECT_TRUE(desktop_->showsWindow("kest")) << "it is on the display, not drawn into memory";
}
