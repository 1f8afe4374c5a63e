#include "ProgramTest.h"
#include "support/Environment.h"

using test_tool::done;
using test_tool::failed;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

constexpr char clockId[] = "com.ravella.clock";

/// The applications that the tips are about, asked for by another one while Kest runs.
class LaunchedApplication : public ProgramTest {
protected:
    void SetUp() override { start(); }

    void launch(const std::vector<std::pair<std::string, std::string>>& extras, const std::string& id = clockId) {
        const support::Environment engine("ELM_ENGINE", "buffer");
        EXPECT_EQ(asking_.launcher().launch({"com.example.caller", id, extras}), device::Launcher::Result::Accepted);
    }
    void waitForText(const std::string& text, const std::string& id = clockId) {
        EXPECT_EQ(device_.run({"wait-for", "text=" + text, "--app", id}), done());
    }
    nlohmann::json tree(const std::string& id = clockId) { return device_.json({"tree", "--app", id}); }
    /// The texts below the title bar.
    std::vector<std::string> lines() {
        std::vector<std::string> lines;
        collect(tree()["elements"], lines);
        return lines;
    }
    static void collect(const nlohmann::json& elements, std::vector<std::string>& lines) {
        for (const nlohmann::json& element : elements) {
            if (element.value("group", "") == "application/line")
                lines.push_back(element["texts"][0]["text"]);
            collect(element.value("children", nlohmann::json::array()), lines);
        }
    }

    device::Device asking_ = device_.open();
};

}  // namespace

TEST_F(LaunchedApplication, ShowsItsNameItsIconAndWhatItWasGiven) {
    launch({{"page", "walk"}, {"cup", "2"}});
    waitForText("page: walk");
    EXPECT_THAT(lines(), ElementsAre("cup: 2", "page: walk"));
    EXPECT_EQ(tree()["title"], "Clock");
    const std::string screen = tree().dump();
    EXPECT_THAT(screen, HasSubstr("\"text\":\"Clock\""));
    EXPECT_THAT(screen, HasSubstr("com.ravella.clock/shared/res/clock.png"));
}

TEST_F(LaunchedApplication, ShowsNothingElseWhenItWasGivenNothing) {
    launch({});
    waitForText("Clock");
    EXPECT_THAT(lines(), IsEmpty());
}

TEST_F(LaunchedApplication, ShowsWhatALaterRequestGives) {
    launch({{"page", "walk"}, {"cup", "2"}});
    waitForText("page: walk");
    const auto applications = device_.json({"status"})["applications"];
    launch({{"page", "run"}});
    waitForText("page: run");
    EXPECT_THAT(lines(), ElementsAre("page: run"));
    EXPECT_EQ(device_.json({"status"})["applications"], applications) << "it is the same process";
}

TEST_F(LaunchedApplication, EndsWithTheBackKeyAndComesBack) {
    launch({{"page", "walk"}});
    waitForText("page: walk");
    EXPECT_EQ(device_.run({"key", "back", "--app", clockId}), done("com.ravella.clock ended\n"));
    launch({{"page", "run"}});
    waitForText("page: run");
}

TEST_F(LaunchedApplication, ShowsHostileTextAsItIs) {
    const std::string markup = "<b>bold</b> &amp; <item href=file:///etc/passwd></item> %s \\n $(reboot)";
    launch({{"<i>", markup}, {"break", "a\nb"}, {"long", std::string(60000, 'x')}});
    waitForText("break: a b");
    EXPECT_THAT(lines(),
                ElementsAre("<i>: " + markup, "break: a b", "long: " + std::string(194, 'x') + "\xE2\x80\xA6"));
}

TEST_F(LaunchedApplication, IsListedAndEndedWithTheDevice) {
    launch({{"page", "walk"}});
    waitForText("page: walk");
    const nlohmann::json launches = device_.json({"launches"});
    ASSERT_EQ(launches.size(), 1U);
    EXPECT_EQ(launches[0]["application"], clockId);
    EXPECT_EQ(launches[0]["extras"], nlohmann::json({{"page", "walk"}}));
    EXPECT_EQ(launches[0]["outcome"], "started");
    const std::string stopped = device_.must({"stop"});
    EXPECT_THAT(stopped, HasSubstr("com.ravella.clock (process "));
    EXPECT_THAT(stopped, HasSubstr("com.ravella.kest (process "));
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(LaunchedApplication, FollowsTheLanguageAndTheTheme) {
    launch({{"page", "walk"}});
    waitForText("page: walk");
    device_.must({"set", "theme", "dark"});
    device_.must({"set", "language", "ko_KR"});
    EXPECT_THAT(lines(), ElementsAre("page: walk"));
    EXPECT_EQ(tree()["title"], "시계");
}

TEST_F(LaunchedApplication, IsWaitedForWhileItIsNotThereYet) {
    EXPECT_EQ(device_.run({"wait-for", "text=page", "--app", clockId, "--timeout", "0"}),
              failed("still not text=page after 0 seconds: com.ravella.clock does not run on this device"));
}

TEST_F(LaunchedApplication, MayBeEveryOneThatTheTipsAreAbout) {
    for (const device::Package& package : asking_.packages().all()) {
        if (package.id == app)
            continue;
        launch({{"page", package.id}}, package.id);
        waitForText("page: " + package.id, package.id);
        EXPECT_THAT(tree(package.id).dump(), HasSubstr("\"text\":\"" + package.label + "\""));
        device_.must({"key", "back", "--app", package.id});
    }
}
