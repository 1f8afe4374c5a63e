#include "LauncherTest.h"

#include <fstream>
#include <stdexcept>
#include <sys/stat.h>
#include <sys/wait.h>

namespace {

using namespace std::chrono_literals;
using device::LaunchOutcome;
using testing::ElementsAre;
using testing::IsEmpty;

/// What the launcher makes of the end of a program that it started. The clock is the test's.
class LaunchedProgramsEnd : public Launching {
protected:
    /// Starts the program, and waits for its end, of which the launcher hears nothing meanwhile.
    void launchAndWait() {
        ASSERT_EQ(launchOnce(), Result::Accepted);
        siginfo_t end{};
        ASSERT_EQ(waitid(P_ALL, 0, &end, WEXITED | WNOWAIT), 0);
    }
    Result launchOnce() { return launcher_.launch({device_.appId(), tea, {}}); }

    std::chrono::steady_clock::time_point now_ = std::chrono::steady_clock::now();
    bool clockFails_ = false;
    device::Launcher launcher_{device_.device(), [this] {
                                   if (clockFails_)
                                       throw std::runtime_error("the clock has stopped");
                                   return now_;
                               }};
};

TEST_F(LaunchedProgramsEnd, IsSeenAtTheNextLaunchWhereNoMainLoopRuns) {
    setProgram("exit 3\n");
    launchAndWait();
    EXPECT_EQ(last().outcome, LaunchOutcome::Started);
    launchOnce();
    EXPECT_EQ(records().at(0).outcome, LaunchOutcome::Failed);
    EXPECT_EQ(records().at(0).reason, "it ended with status 3");
    EXPECT_EQ(records().at(1).outcome, LaunchOutcome::Started) << "the first one runs no more";
}

TEST_F(LaunchedProgramsEnd, WithinTenSecondsIsAFailureToStart) {
    setProgram("exit 3\n");
    launchAndWait();
    now_ += 10s;
    launchOnce();
    EXPECT_EQ(records().at(0).outcome, LaunchOutcome::Failed);
}

TEST_F(LaunchedProgramsEnd, AfterTenSecondsIsNone) {
    setProgram("exit 3\n");
    launchAndWait();
    now_ += 10s + 1ms;
    launchOnce();
    EXPECT_EQ(records().at(0).outcome, LaunchOutcome::Started);
    EXPECT_THAT(device_.logMessages(), IsEmpty());
}

TEST_F(LaunchedProgramsEnd, IsAHandOverWhereAnotherProcessWasTheApplicationFirst) {
    const std::filesystem::path gate = device_.folder() / "gate";
    ASSERT_EQ(mkfifo(gate.c_str(), 0600), 0);
    setProgram("read line < " + gate.string() + "\n");
    EXPECT_EQ(launchOnce(), Result::Accepted);
    EXPECT_EQ(last().outcome, LaunchOutcome::Started);
    const support::Process first = running();
    std::ofstream(gate) << "go on\n";
    EXPECT_TRUE(becomes(LaunchOutcome::HandedOver));
}

TEST_F(LaunchedProgramsEnd, IsALineInTheLogWhereItCannotBeDealtWith) {
    setProgram("exit 3\n");
    EXPECT_EQ(launchOnce(), Result::Accepted);
    clockFails_ = true;
    EXPECT_TRUE(loopUntil([this] { return !device_.logMessages().empty(); }));
    EXPECT_THAT(device_.logMessages(), ElementsAre("E DEVICE the clock has stopped"));
    EXPECT_EQ(last().outcome, LaunchOutcome::Started);
}

}  // namespace
