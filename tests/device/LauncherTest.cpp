#include "LauncherTest.h"

#include <sys/wait.h>

namespace {

using device::LaunchOutcome;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Pair;

TEST_F(Launching, StartsTheProgramWithItsExtrasOnThisDevice) {
    setProgram("echo \"$#\" \"$1\" \"$2\"; echo \"$KEST_DEVICE\"\n");
    EXPECT_EQ(launch({{"page", "walk; rm -r *"}, {"text", "a=b"}}), Result::Accepted);
    EXPECT_TRUE(saysSoon("2 page=walk; rm -r * text=a=b\n" + device_.root().string() + "\n")) << said();
    EXPECT_EQ(last().request.caller, device_.appId());
    EXPECT_EQ(last().request.appId, tea);
    EXPECT_THAT(last().request.extras, ElementsAre(Pair("page", "walk; rm -r *"), Pair("text", "a=b")));
    EXPECT_EQ(last().outcome, LaunchOutcome::Started);
    EXPECT_EQ(last().reason, "");
}

TEST_F(Launching, KeepsItsPlannedFaultsToItself) {
    setProgram("echo \"<$DEVICE_FAULTS>\"\n");
    setenv("DEVICE_FAULTS", "preference_set_string=-5", 1);
    launch();
    EXPECT_TRUE(saysSoon("<>\n")) << said();
    unsetenv("DEVICE_FAULTS");
}

TEST_F(Launching, LeavesNoZombie) {
    setProgram("exit 0\n");
    for (int number = 0; number < 5; ++number)
        EXPECT_EQ(launch(), Result::Accepted);
    EXPECT_TRUE(loopUntil([] { return waitpid(-1, nullptr, WNOHANG) < 0 && errno == ECHILD; }));
}

TEST_F(Launching, DoesNotWaitForAProgramThatHangs) {
    setHangingProgram();
    const auto begin = std::chrono::steady_clock::now();
    EXPECT_EQ(launch(), Result::Accepted);
    EXPECT_LT(std::chrono::steady_clock::now() - begin, std::chrono::seconds(5));
    EXPECT_EQ(last().outcome, LaunchOutcome::Started);
    const auto child = waitpid(-1, nullptr, WNOHANG);
    EXPECT_EQ(child, 0) << "it runs";
    endProgram();
}

TEST_F(Launching, SaysWhyAProgramEndedAtOnce) {
    setProgram("echo boiling; echo 'the kettle is empty' >&2; exit 3\n");
    EXPECT_EQ(launch(), Result::Accepted);
    ASSERT_TRUE(becomes(LaunchOutcome::Failed));
    EXPECT_EQ(last().reason, "it ended with status 3; its last words: the kettle is empty");
    EXPECT_THAT(device_.logMessages(), ElementsAre("W DEVICE com.example.app cannot launch \"com.example.tea\": it "
                                                   "ended with status 3; its last words: the kettle is empty"));
    setProgram("kill -SEGV $$\n");
    launch();
    ASSERT_TRUE(becomes(LaunchOutcome::Failed));
    EXPECT_EQ(last().reason, "it ended by signal 11 (Segmentation fault)");
}

TEST_F(Launching, AProgramThatEndsWellWasStarted) {
    setProgram("echo done\n");
    launch();
    ASSERT_TRUE(loopUntil([] { return waitpid(-1, nullptr, WNOHANG) < 0; }));
    EXPECT_EQ(last().outcome, LaunchOutcome::Started);
}

TEST_F(Launching, ASecondProcessHandsOverToTheOneThatRuns) {
    const support::Process first = running();
    setProgram("exit 0\n");
    support::writeFile(device_->folder().output(tea), "said before\n");
    EXPECT_EQ(launch({{"page", "2"}}), Result::Accepted);
    EXPECT_EQ(last().outcome, LaunchOutcome::Asked);
    EXPECT_TRUE(becomes(LaunchOutcome::HandedOver));
    EXPECT_EQ(said(), "said before\n");
}

TEST_F(Launching, SaysThatTheOneThatRunsDoesNotAnswer) {
    const support::Process first = running();
    setProgram("echo 'it does not answer' >&2; exit 1\n");
    EXPECT_EQ(launch(), Result::Accepted);
    ASSERT_TRUE(becomes(LaunchOutcome::Failed));
    EXPECT_EQ(last().reason, "it ended with status 1; its last words: it does not answer");
}

TEST_F(Launching, OneThatIsOnItsWayCountsAsRunning) {
    setHangingProgram();
    launch();
    ASSERT_TRUE(loopUntil([&] { return !said().empty(); }));
    setProgram("exit 0\n");
    launch();
    EXPECT_EQ(last().outcome, LaunchOutcome::Asked);
    EXPECT_TRUE(becomes(LaunchOutcome::HandedOver));
    endProgram();
}

TEST_F(Launching, OfItselfKeepsTheLockThatMakesItTheApplication) {
    const device::ApplicationLock lock(device_->folder(), device_.appId());
    ASSERT_TRUE(lock.isHeld());
    support::writeFile(device_.appRoot() / "bin/app", "#!/bin/sh\n");
    std::filesystem::permissions(device_.appRoot() / "bin/app", std::filesystem::perms::owner_all);
    EXPECT_EQ(launch({}, device_.appId()), Result::Accepted);
    auto other = support::Process::ofWork(
        [this] { return device::ApplicationLock::holder(device::Folder(device_.root()), device_.appId()) ? 0 : 1; });
    EXPECT_EQ(other.wait(), 0);
}

TEST_F(Launching, NeedsAnInstalledApplication) {
    for (const std::string id : {"com.example.none", "", "../tea", "com.example.tea/../tea", "com.example.\xff", "a b",
                                 "com.example.tea;reboot", "$(reboot)"}) {
        EXPECT_EQ(launch({}, id), Result::NotFound) << id;
        EXPECT_EQ(last().request.appId, id);
        EXPECT_EQ(last().outcome, LaunchOutcome::Failed);
        EXPECT_EQ(last().reason, "it is not installed");
    }
    EXPECT_EQ(device_.logMessages().front(),
              "W DEVICE com.example.app cannot launch \"com.example.none\": it is not installed");
}

TEST_F(Launching, NeedsAProgramInTheManifest) {
    support::writeFile(device_.preinstalled() / tea / "tizen-manifest.xml", "<manifest package='com.example.tea'/>");
    EXPECT_EQ(launch(), Result::NotFound);
    EXPECT_EQ(last().reason, "it has no program: its manifest names none");
}

TEST_F(Launching, NeedsAProgramThatCanRun) {
    const std::string line = "com.example.tea cannot start: " + program().string() + " is no program";
    EXPECT_EQ(launch(), Result::Failed);
    EXPECT_EQ(last().reason, line);
    support::writeFile(program(), "#!/bin/sh\n");
    EXPECT_EQ(launch(), Result::Failed);
    EXPECT_EQ(last().reason, line) << "it may not be executed";
    std::filesystem::remove(program());
    std::filesystem::create_directory(program());
    EXPECT_EQ(launch(), Result::Failed);
    EXPECT_EQ(last().reason, line);
    std::filesystem::remove(program());
    support::writeFile(program(), "neither a script nor a program");
    std::filesystem::permissions(program(), std::filesystem::perms::owner_all);
    EXPECT_EQ(launch(), Result::Failed);
    EXPECT_EQ(last().reason, "cannot start " + program().string() + ": Exec format error");
}

TEST_F(Launching, NeedsASoundManifest) {
    const auto manifest = device_.preinstalled() / tea / "tizen-manifest.xml";
    support::writeFile(manifest, "<manifest");
    EXPECT_EQ(launch(), Result::Failed);
    EXPECT_THAT(last().reason, HasSubstr(manifest.string() + ":1: is not well-formed XML"));
}

TEST_F(Launching, RefusesExtrasThatCannotBeHandedOver) {
    setProgram("echo started\n");
    EXPECT_EQ(launch({{"text", "caf\xe9"}}), Result::Rejected);
    EXPECT_EQ(last().reason, "the extra \"text\" is not UTF-8");
    EXPECT_EQ(launch({{"a=b", "c"}}), Result::Rejected);
    EXPECT_EQ(last().reason, "the extra \"a=b\" has a \"=\" in its name");
    EXPECT_EQ(launch({{"text", std::string(1 << 20, 'x')}}), Result::Rejected);
    EXPECT_EQ(last().reason, "the request is larger than 64 KiB");
    EXPECT_THAT(last().request.extras, IsEmpty());
    EXPECT_EQ(launch({}, std::string(1 << 20, 'x')), Result::Rejected);
    EXPECT_EQ(last().request.appId, std::string(255, 'x'));
    EXPECT_EQ(said(), "");
}

TEST_F(Launching, TakesExtrasOf64KiBInAll) {
    setProgram("echo ${#1}\n");
    // With the application's id, the key and what passing it on costs.
    const std::size_t most = 64 * 1024 - std::string(tea).size() - 4 - 8;
    EXPECT_EQ(launch({{"text", std::string(most + 1, 'x')}}), Result::Rejected);
    EXPECT_EQ(launch({{"text", std::string(most, 'x')}}), Result::Accepted);
    EXPECT_TRUE(saysSoon(std::to_string(most + 5) + "\n")) << said();
}

TEST_F(Launching, CountsEightBytesMoreForEachExtra) {
    setProgram("echo $#\n");
    std::vector<std::pair<std::string, std::string>> extras;
    for (std::size_t size = std::string(tea).size() + 12; size <= 64 * 1024; size += 12)
        extras.emplace_back(std::to_string(1000 + extras.size()), "");
    EXPECT_EQ(launch(extras), Result::Accepted);
    EXPECT_TRUE(saysSoon("5460\n")) << said();
    extras.emplace_back("more", "");
    EXPECT_EQ(launch(extras), Result::Rejected);
    EXPECT_EQ(last().reason, "the request is larger than 64 KiB");
}

TEST_F(Launching, GoesOnWithoutARecordWhereTheDiskIsFull) {
    setProgram("echo started\n");
    device_->database().sql().exec("PRAGMA max_page_count = 20");
    EXPECT_EQ(launch({{"text", std::string(65000, 'x')}}), Result::Accepted);
    EXPECT_TRUE(saysSoon("started\n"));
    EXPECT_THAT(records(), IsEmpty());
    EXPECT_THAT(device_.logMessages(),
                ElementsAre("E DEVICE " + device_.root().string() +
                            "/device.db: the disk is full (database or disk is full); free some space and try again"));
}

TEST_F(Launching, WaitsForAWriterOfTheDatabaseOnlyShortly) {
    setProgram("echo started\n");
    SQLite::Database other((device_.root() / "device.db").string(), SQLite::OPEN_READWRITE);
    other.exec("BEGIN IMMEDIATE");
    const auto begin = std::chrono::steady_clock::now();
    EXPECT_EQ(launch(), Result::Accepted);
    EXPECT_LT(std::chrono::steady_clock::now() - begin, std::chrono::seconds(3));
    EXPECT_TRUE(saysSoon("started\n"));
    EXPECT_EQ(device_->database().sql().execAndGet("PRAGMA busy_timeout").getInt(), 5000);
}

TEST_F(Launching, GoesOnWhereTheProgramsWordsCannotBeKept) {
    setProgram("echo started; echo \"$1\" > " + (device_.folder() / "proof").string() + "\n");
    support::writeFile(device_.root() / "output", "no folder");
    EXPECT_EQ(launch({{"cup", "2"}}), Result::Accepted);
    EXPECT_TRUE(loopUntil([&] { return support::readFile(device_.folder() / "proof") == "cup=2\n"; }));
}

}  // namespace
