#include "ToolTest.h"

#include "device/ApplicationLock.h"

#include <future>
#include <optional>
#include <poll.h>

using testing::HasSubstr;
using testing::IsEmpty;

namespace {

/// What the commands about the screen do with the sample, which runs.
class OnScreen : public SampleToolTest {
protected:
    void SetUp() override {
        SampleToolTest::SetUp();
        ASSERT_EQ(start().status, 0);
    }
    Result waitFor(const std::string& condition) { return run({"wait-for", condition, "--timeout", "0"}); }
};

class WithoutScreen : public ToolTest {};

/// The first element of that type in a tree.
nlohmann::json find(const nlohmann::json& elements, const std::string& type) {
    for (const nlohmann::json& element : elements) {
        if (element["type"] == type) {
            return element;
        }
        if (nlohmann::json below = find(element.value("children", nlohmann::json::array()), type); !below.is_null()) {
            return below;
        }
    }
    return nullptr;
}

}  // namespace

TEST_F(OnScreen, TheTreeTellsTheListAndItsRows) {
    const nlohmann::json list = find(device_.json({"tree"})["elements"], "Elm_Genlist");

    EXPECT_EQ(list["name"], "FruitView");
    EXPECT_EQ(list["visible"], true);
    ASSERT_EQ(list["rows"].size(), 40U);
    EXPECT_EQ(list["rows"][0]["texts"][0]["text"], "Apple");
    EXPECT_EQ(list["rows"][39]["visible"], false);
}

TEST_F(OnScreen, TheTreeForPeopleHasALineForEachRowAndText) {
    const std::string tree = device_.must({"tree"});

    EXPECT_THAT(tree, testing::StartsWith("window \"Sample\" 720x1280\n"));
    EXPECT_THAT(tree, HasSubstr("item \"Fruits en_US\" FruitView on top\n"));
    EXPECT_THAT(tree, testing::ContainsRegex("\n +Elm_Genlist FruitView 0,[0-9]+ 720x[0-9]+ elm/genlist/base/default\n"
                                             " +row 1 default 0,[0-9]+ 720x[0-9]+\n"
                                             " +\"Apple\" [0-9]+,[0-9]+ [0-9]+x[0-9]+ elm\\.text\n"));
    EXPECT_THAT(tree, testing::ContainsRegex("\n +\\(row 40 default [0-9]+,[0-9]+ [0-9]+x[0-9]+\\)\n"));
}

TEST_F(OnScreen, ATapOnATextOpensItsPage) {
    EXPECT_EQ(run({"tap", "--text", "Apple"}), done());

    EXPECT_EQ(waitFor("view=PageView"), done());
    EXPECT_EQ(waitFor("no-text=Apple"), done());
}

TEST_F(OnScreen, ATapOnAPlaceOpensItsPage) {
    const nlohmann::json row = find(device_.json({"tree"})["elements"], "Elm_Genlist")["rows"][1];
    const int y = row["y"].get<int>() + row["height"].get<int>() / 2;

    EXPECT_EQ(run({"tap", "360", std::to_string(y)}), done());

    EXPECT_EQ(waitFor("view=PageView"), done());
}

TEST_F(OnScreen, ASwipeScrollsAndAKeyGoesBack) {
    EXPECT_EQ(run({"swipe", "360", "1000", "360", "300"}), done());
    EXPECT_EQ(waitFor("no-text=Apple"), done());
    device_.must({"tap", "360", "600"});

    EXPECT_EQ(run({"key", "BackSpace"}), done());

    EXPECT_EQ(waitFor("view=FruitView"), done());
}

TEST_F(OnScreen, WhatCannotBeTappedIsAnErrorThatSaysWhatThereIs) {
    EXPECT_EQ(run({"tap", "--", "-1", "5"}), failed("the place -1,5 is outside the screen, which is 720x1280"));
    EXPECT_THAT(run({"tap", "--text", "Pear"}).err,
                testing::StartsWith("kest-device: error: no text \"Pear\" on the screen; in sight are: \"Fruits "
                                    "en_US\", \"Apple\", \"Fruit 1\", "));
    EXPECT_EQ(run({"key", "Hyper"}),
              failed("unknown key \"Hyper\"; there are Up, Down, Left, Right, Return, KP_Enter, space, Tab, Escape, "
                     "Delete, Home, End, Prior, BackSpace, XF86Back, Next, back, letters and digits"));
}

TEST_F(OnScreen, AnOutputThatNobodyReadsOnIsNotComplainedOf) {
    const Result result = device_.runUnread({"tree"});

    EXPECT_EQ(result.err, "");
    // Without an error too where the reader had not yet gone.
    EXPECT_THAT(result.status, testing::AnyOf(141, 0));
}

TEST_F(OnScreen, AKeyThatEndsTheApplicationWasPressedAllTheSame) {
    EXPECT_EQ(run({"key", "Escape"}).status, 0);
}

TEST_F(OnScreen, ALanguageIsOnTheScreenWhenSetComesBack) {
    EXPECT_EQ(run({"set", "language", "ko_KR"}), done());

    EXPECT_EQ(waitFor("text=Fruits ko_KR"), done());
}

TEST_F(OnScreen, ALanguageThatIsUnsetIsFollowedToo) {
    device_.must({"set", "language", "ko_KR"});
    EXPECT_EQ(run({"unset", "language"}), done());
    EXPECT_THAT(device_.must({"tree"}), HasSubstr("Fruits en_US"));
}

TEST_F(OnScreen, ATreeMayBeLargerThanTheBusTakesAtOnce) {
    device_.must({"stop"});
    ASSERT_EQ(start({"mode=talkative"}).status, 0);
    EXPECT_GT(device_.must({"tree"}).size(), 500000U);
}

TEST_F(OnScreen, WaitingEndsWhenItIsSo) {
    EXPECT_EQ(waitFor("rows=40"), done());
    EXPECT_EQ(waitFor("text=Pear"), failed("still not text=Pear after 0 seconds"));
    device_.open().usage().append("content://log", {{"feature", "AB01"}});
    EXPECT_EQ(waitFor("usage=AB01"), done());
    EXPECT_EQ(waitFor("usage=AB02"), failed("still not usage=AB02 after 0 seconds"));
    device_.open().log().write(device::Log::Level::Info, "TAG", "\x1b[0;34m>>>HIT<<<\x1b[0;m");
    EXPECT_EQ(waitFor("log=TAG(" + std::to_string(getpid()) + ") >>>HIT<<<"), done());
    EXPECT_EQ(waitFor("log=nothing of the kind"), failed("still not log=nothing of the kind after 0 seconds"));
}

TEST_F(OnScreen, WaitingForTheEndEndsWithTheApplication) {
    EXPECT_EQ(waitFor("ended"), failed("still not ended after 0 seconds"));
    kill(device_.application(), SIGKILL);

    EXPECT_EQ(run({"wait-for", "ended"}), done());
}

TEST_F(OnScreen, WaitingGoesOnUntilItsTimeIsOverThoughTheApplicationDoesNotAnswer) {
    const std::string named = "com.example.sample (process " + std::to_string(device_.application()) + ")";
    kill(device_.application(), SIGSTOP);

    for (const std::vector<std::string>& app : {std::vector<std::string>{}, {"--app", sample}}) {
        std::vector<std::string> words{"wait-for", "text=Apple", "--timeout", "0.5"};
        words.insert(words.end(), app.begin(), app.end());
        EXPECT_EQ(run(words), failed("still not text=Apple after 0.5 seconds: " + named +
                                     " does not answer; end it with 'kest-device stop'"));
    }
}

TEST_F(OnScreen, WaitingFindsTheBusThatComesWithTheApplication) {
    device_.must({"stop"});
    test_tool::TestDevice same;
    same.setRoot(device_.root());
    auto result = std::async(std::launch::async, [&] { return same.run({"wait-for", "text=Apple", "--app", sample}); });
    poll(nullptr, 0, 300);

    EXPECT_EQ(start().status, 0);

    EXPECT_EQ(result.get(), done());
}

TEST_F(OnScreen, AScreenshotIsSavedWhereThePersonIs) {
    EXPECT_EQ(run({"screenshot", "screen.png"}), done());

    EXPECT_EQ(support::readFile(device_.folder() / "screen.png").substr(1, 3), "PNG");
}

TEST_F(OnScreen, AScreenshotThatCannotBeSavedIsAnError) {
    const std::string folder = device_.folder();

    EXPECT_EQ(run({"screenshot", "none/screen.png"}),
              failed("cannot write the picture " + folder + "/none/screen.png: " + folder + "/none is no folder"));
    EXPECT_EQ(run({"screenshot", "screen.jpg"}),
              failed("cannot write the picture " + folder + "/screen.jpg: its name must end in .png"));
}

TEST_F(OnScreen, AnApplicationThatHangsIsSaidToDoSo) {
    const pid_t application = device_.application();
    kill(application, SIGSTOP);

    EXPECT_EQ(run({"tree"}), failed("com.example.sample (process " + std::to_string(application) +
                                    ") does not answer; end it with 'kest-device stop'"));
    EXPECT_EQ(run({"set", "theme", "dark"}),
              failed("the change is made, but com.example.sample (process " + std::to_string(application) +
                     ") does not answer, so it may not follow before its next start; end it with 'kest-device stop'"));
    EXPECT_EQ(run({"get", "theme"}), done("dark\n"));
    EXPECT_EQ(run({"stop"}), done("com.example.sample (process " + std::to_string(application) +
                                  ") did not answer and was ended by force\n"));
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(WithoutScreen, WaitingEndsWithItsTimeThoughAnApplicationIsComingUp) {
    device_.must({"get"});
    const device::ApplicationLock comingUp(device::Folder(device_.root()), "com.example.app");

    EXPECT_EQ(run({"wait-for", "text=A", "--timeout", "0.2"}),
              failed("still not text=A after 0.2 seconds: com.example.app (process " + std::to_string(getpid()) +
                     ") does not answer; end it with 'kest-device stop'"));
}

TEST_F(WithoutScreen, ACommandWaitsForTheEndOfAnApplicationThatHasLeftTheBus) {
    device_.must({"get"});
    std::optional<device::ApplicationLock> ending;
    ending.emplace(device::Folder(device_.root()), "com.example.app");
    // From then on it is no longer one that may be coming up.
    poll(nullptr, 0, 5500);
    auto result = std::async(std::launch::async, [&] { return run({"tree"}); });
    poll(nullptr, 0, 300);
    ending.reset();

    EXPECT_EQ(result.get(), failed("no application runs on this device; start one with 'kest-device start'"));
}

TEST_F(WithoutScreen, CommandsSayThatNothingRuns) {
    for (const std::vector<std::string>& words :
         {std::vector<std::string>{"tree"}, {"tap", "1", "1"}, {"screenshot", "a.png"}, {"wait-for", "text=A"}}) {
        EXPECT_EQ(run(words), failed("no application runs on this device; start one with 'kest-device start'"));
    }
    EXPECT_EQ(run({"tree", "--app", "com.example.sample"}),
              failed("com.example.sample does not run on this device; start it with 'kest-device start -- "
                     "com.example.sample'"));
    EXPECT_EQ(run({"wait-for", "ended"}), done());
}
