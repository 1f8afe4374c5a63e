#include "ProgramTest.h"

#include "device/ApplicationLock.h"
#include "support/Environment.h"
#include "support/Process.h"

#include <poll.h>

using test_tool::done;
using testing::HasSubstr;
using testing::Not;

namespace {

/// Commands that name no application, on a device where several run.
class InFront : public ProgramTest {
protected:
    /// One that takes its time between its start and the bus.
    static inline const std::vector<std::string> slowStart = {"start", "--headless", "--", "com.example.sample",
                                                              "mode=slow"};
    static constexpr char sample[] = "com.example.sample";
    static constexpr char clock[] = "com.ravella.clock";

    void startSample() { device_.must({"start", "--headless", "--", sample}); }
    /// By the link of a tip, which stands below what is in sight at first.
    void openClock() {
        device_.must({"tap", "--text", "Pick a clock"});
        device_.must({"swipe", "240", "790", "240", "300"});
        device_.must({"tap", "--text", "Choose a clock face"});
        device_.must({"wait-for", "text=page: faces", "--app", clock});
    }
    std::string tree() { return device_.must({"tree"}); }
    /// Whether the last launch comes to that: whoever asked notes it when it hears of it.
    bool launchBecomes(const std::string& outcome) {
        nlohmann::json launches;
        for (int attempt = 0; attempt < 500; ++attempt) {
            launches = device_.json({"launches"});
            if (!launches.empty() && launches.back()["outcome"] == outcome)
                return true;
            poll(nullptr, 0, 20);
        }
        ADD_FAILURE() << launches;
        return false;
    }
    /// Whether the sample comes to run, on the bus or not.
    bool sampleRunsSoon() const {
        for (int attempt = 0; attempt < 5000; ++attempt) {
            if (device::ApplicationLock::holder(device::Folder(device_.root()), sample))
                return true;
            poll(nullptr, 0, 2);
        }
        return false;
    }
};

}  // namespace

TEST_F(InFront, IsTheApplicationThatWasStartedLast) {
    device_.must({"install", SAMPLE_PACKAGE});
    startSample();
    start();
    EXPECT_THAT(tree(), HasSubstr("Tips and guidelines"));
    device_.must({"stop"});
    start();
    startSample();
    EXPECT_THAT(tree(), HasSubstr("Fruits"));
    device_.must({"tap", "--text", "Apple"});
    EXPECT_THAT(tree(), HasSubstr("PageView"));
    EXPECT_TRUE(holds("view=PageView"));
    EXPECT_THAT(device_.must({"tree", "--app", app}), HasSubstr("Tips and guidelines"));
}

TEST_F(InFront, IsTheApplicationThatALinkOpensUntilItsBackKeyEndsIt) {
    start();
    openClock();
    EXPECT_THAT(device_.must({"launches"}), HasSubstr("com.ravella.clock  page=faces  started"));
    EXPECT_THAT(tree(), HasSubstr("page: faces"));
    device_.must({"key", "Escape"});
    EXPECT_THAT(tree(), HasSubstr("KestContentView"));
    device_.must({"key", "Escape"});
    EXPECT_THAT(tree(), HasSubstr("Tips and guidelines"));
}

TEST_F(InFront, IsTheApplicationThatALinkHandsOverTo) {
    device_.must({"start", "--headless", "--", clock});
    start();
    openClock();
    EXPECT_THAT(tree(), HasSubstr("page: faces"));
    EXPECT_THAT(tree(), Not(HasSubstr("KestContentView")));
    EXPECT_TRUE(launchBecomes("handed over"));
}

TEST_F(InFront, IsTheApplicationThatWasHandedOverToThoughWhoAskedDidNotNoteIt) {
    device_.must({"start", "--headless", "--", clock});
    start();
    {
        device::Device asking = device_.open();
        EXPECT_EQ(asking.launcher().launch({"com.example.caller", clock, {{"page", "faces"}}}),
                  device::Launcher::Result::Accepted);
    }
    device_.must({"wait-for", "text=page: faces", "--app", clock});
    EXPECT_EQ(device_.json({"launches"})[0]["outcome"], "asked");
    EXPECT_THAT(tree(), HasSubstr("page: faces"));
}

TEST_F(InFront, IsTheApplicationThatWasStartedOnceMoreByHand) {
    start();
    device_.must({"install", SAMPLE_PACKAGE});
    startSample();
    EXPECT_THAT(tree(), HasSubstr("Fruits"));
    const support::Environment folder("KEST_DEVICE", device_.root().string());
    const support::Environment home("HOME", device_.folder().string());
    const support::Environment engine("ELM_ENGINE", "buffer");
    EXPECT_EQ(support::Process::ofProgram({KEST_PROGRAM}).wait(), 0);
    EXPECT_THAT(tree(), HasSubstr("Tips and guidelines"));
}

TEST_F(InFront, IsTheApplicationThatIsStillComingUp) {
    device_.must({"install", SAMPLE_PACKAGE});
    start();
    const test_tool::BackgroundRun starting = device_.runInBackground(slowStart);
    ASSERT_TRUE(sampleRunsSoon());
    EXPECT_THAT(tree(), HasSubstr("Fruits"));
}

TEST_F(InFront, IsWaitedForWhileItIsComingUp) {
    device_.must({"install", SAMPLE_PACKAGE});
    start();
    const test_tool::BackgroundRun starting = device_.runInBackground(slowStart);
    ASSERT_TRUE(sampleRunsSoon());
    EXPECT_EQ(device_.run({"wait-for", "text=Apple"}), done());
}
