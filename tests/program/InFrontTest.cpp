#include "ProgramTest.h"

using testing::HasSubstr;
using testing::Not;

namespace {

/// Commands that name no application, on a device where several run.
class InFront : public ProgramTest {
protected:
    static constexpr char sample[] = "com.example.sample";
    static constexpr char clock[] = "com.ravella.clock";

    void startSample() { device_.must({"start", "--headless", "--", sample}); }
    /// By the link of a tip, which stands below what is in sight at first.
    void openClock() {
        device_.must({"tap", "--text", "Pick a clock"});
        device_.must({"swipe", "360", "1150", "360", "600"});
        device_.must({"tap", "--text", "Choose a clock face"});
        device_.must({"wait-for", "text=page: faces", "--app", clock});
    }
    std::string tree() { return device_.must({"tree"}); }
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
    EXPECT_THAT(device_.must({"launches"}), HasSubstr("handed over"));
    EXPECT_THAT(tree(), HasSubstr("page: faces"));
    EXPECT_THAT(tree(), Not(HasSubstr("KestContentView")));
}
