#include "ToolTest.h"

namespace {

namespace fs = std::filesystem;

/// The user's home, where the environment names no run directory either.
class Home : public SampleToolTest {
protected:
    void SetUp() override {
        device_.setEnvironment("XDG_RUNTIME_DIR", std::nullopt);
        SampleToolTest::SetUp();
    }
};

}  // namespace

TEST_F(Home, GetsNothingOfTheDevice) {
    EXPECT_EQ(start().status, 0);
    EXPECT_EQ(run({"tree"}).status, 0);
    EXPECT_EQ(run({"stop"}).status, 0);

    EXPECT_TRUE(fs::is_empty(device_.folder() / "home"));
}

TEST_F(Home, NeedNotBeThere) {
    device_.setEnvironment("HOME", (device_.folder() / "none").string());

    const Result started = start();
    EXPECT_EQ(started.status, 0) << started;
    EXPECT_EQ(run({"stop"}).status, 0);

    EXPECT_FALSE(fs::exists(device_.folder() / "none"));
}
