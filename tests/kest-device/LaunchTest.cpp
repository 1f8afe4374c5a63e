#include "ToolTest.h"

#include <csignal>

using testing::HasSubstr;
using testing::IsEmpty;

namespace {

class Launch : public SampleToolTest {
protected:
    Result launch(const std::vector<std::string>& words) {
        std::vector<std::string> all{"launch", sample};
        all.insert(all.end(), words.begin(), words.end());
        return run(all);
    }
    static std::string process(pid_t id) { return " (process " + std::to_string(id) + ")"; }
    /// The last launch request that the device keeps, without its number and time.
    nlohmann::json kept() {
        const nlohmann::json all = device_.json({"launches"});
        nlohmann::json last = all.empty() ? nlohmann::json() : all.back();
        last.erase("id");
        last.erase("time");
        return last;
    }
    static nlohmann::json record(const nlohmann::json& extras, const std::string& outcome,
                                 const std::string& reason = "") {
        return {{"caller", "kest-device"},
                {"application", sample},
                {"extras", extras},
                {"outcome", outcome},
                {"reason", reason}};
    }
};

}  // namespace

TEST_F(Launch, StartsAnApplicationThatDoesNotRun) {
    const Result result = launch({"title=Pears", "--headless"});

    EXPECT_EQ(result, done("com.example.sample runs, headless" + process(device_.application()) + "\n"));
    EXPECT_EQ(run({"wait-for", "text=Apple", "--timeout", "0"}), done());
    EXPECT_EQ(kept(), record({{"title", "Pears"}}, "started"));
    device_.must({"stop"});
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(Launch, HandsTheRequestToAnApplicationThatRuns) {
    ASSERT_EQ(start().status, 0);
    const pid_t application = device_.application();

    EXPECT_EQ(launch({"title=a=b \"c\" $(touch oops)", "empty="}),
              done("com.example.sample has the request" + process(application) + "\n"));

    EXPECT_THAT(device_.must({"tree"}), HasSubstr("a=b \"c\" $(touch oops)"));
    EXPECT_EQ(device_.application(), application);
    EXPECT_EQ(kept(), record({{"title", "a=b \"c\" $(touch oops)"}, {"empty", ""}}, "handed over"));
}

TEST_F(Launch, GivesJson) {
    const nlohmann::json started = nlohmann::json::parse(device_.must({"launch", sample, "--headless", "--json"}));
    nlohmann::json expected{
        {"application", sample}, {"process", device_.application()}, {"outcome", "started"}, {"folder", root()}};
    EXPECT_EQ(started, expected);

    expected["outcome"] = "handed over";
    EXPECT_EQ(device_.json({"launch", sample}), expected);

    expected["process"] = nullptr;
    EXPECT_EQ(device_.json({"launch", sample, "mode=ends"}), expected);
}

TEST_F(Launch, OfAnApplicationThatEndsWellIsDone) {
    EXPECT_EQ(launch({"mode=ends", "--headless"}), done("com.example.sample was started and ended by itself\n"));

    EXPECT_THAT(device_.processes(), IsEmpty()) << "nor is a bus left for nobody";
    EXPECT_EQ(kept(), record({{"mode", "ends"}}, "started"));
}

TEST_F(Launch, ThatEndsAnApplicationIsDone) {
    ASSERT_EQ(start().status, 0);

    EXPECT_EQ(launch({"mode=ends"}), done("com.example.sample has the request and ended by itself\n"));
    EXPECT_EQ(kept(), record({{"mode", "ends"}}, "handed over"));
    EXPECT_EQ(device_.json({"status"})["applications"], nlohmann::json::array());
}

TEST_F(Launch, OfAnApplicationThatFailsIsAnErrorWithItsLastWords) {
    const std::string message =
        "com.example.sample ended with status 3 before it was on the screen; its last words (of " + root() +
        "/output/com.example.sample.log): the fruits are rotten";

    EXPECT_EQ(launch({"mode=fails", "--headless"}), failed(message));
    EXPECT_EQ(kept(), record({{"mode", "fails"}}, "failed", message));
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(Launch, WithoutADisplayIsRefused) {
    EXPECT_EQ(launch({}), failed("there is no display to open a window on; use --headless"));
    EXPECT_EQ(kept(),
              record(nlohmann::json::object(), "failed", "there is no display to open a window on; use --headless"));
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(Launch, OfAnUnknownApplicationListsWhatIsInstalled) {
    const std::string message = "com.example.none is not installed; what is: " + installed();
    ASSERT_THAT(message, HasSubstr(sample));

    EXPECT_EQ(run({"launch", "com.example.none", "--headless"}), failed(message));
    EXPECT_EQ(kept()["application"], "com.example.none");
    EXPECT_EQ(kept()["reason"], message);
}

TEST_F(Launch, ToAnApplicationThatHangsIsAnError) {
    ASSERT_EQ(start().status, 0);
    const pid_t application = device_.application();
    kill(application, SIGSTOP);

    const Result result = launch({"title=Pears"});

    kill(application, SIGCONT);
    EXPECT_EQ(result, failed("com.example.sample" + process(application) +
                             " does not take the request: com.example.sample did not answer within 5 s"));
    EXPECT_EQ(kept()["outcome"], "failed");
}

TEST_F(Launch, StartsOnceHoweverManyAskAtATime) {
    const auto other = device_.runInBackground({"launch", sample, "title=Pears", "--headless"});

    ASSERT_EQ(launch({"title=Plums", "--headless"}).status, 0);

    const pid_t application = device_.application();
    ASSERT_NE(application, 0);
    const std::string started = "com.example.sample runs, headless" + process(application) + "\n";
    const std::string handedOver = "com.example.sample has the request" + process(application) + "\n";
    EXPECT_TRUE(other.outBecomes(started) || other.out() == handedOver) << other.out();
}
