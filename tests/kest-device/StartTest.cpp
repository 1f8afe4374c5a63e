#include "ToolTest.h"

#include "support/FullDisk.h"
#include "support/PrivateBus.h"

#include <csignal>

using support::FullDisk;
using testing::IsEmpty;
using testing::StartsWith;

namespace {

namespace fs = std::filesystem;

class Start : public SampleToolTest {
protected:
    std::string runs(pid_t process) const {
        return "com.example.sample runs, headless (process " + std::to_string(process) + ")\n";
    }
    static std::string named(pid_t process) { return "com.example.sample (process " + std::to_string(process) + ")"; }
};

class StartRefused : public ToolTest {};

}  // namespace

TEST_F(Start, ComesBackWhenTheApplicationIsOnTheScreen) {
    const Result result = start();

    EXPECT_EQ(result, done(runs(device_.application())));
    EXPECT_EQ(run({"wait-for", "text=Apple", "--timeout", "0"}), done());
}

TEST_F(Start, WithoutASessionBusTheDeviceHasAPrivateOneUntilItIsStopped) {
    device_.must({"start", "--headless", "--", sample});
    const pid_t application = device_.application();

    EXPECT_EQ(device_.json({"status"}),
              nlohmann::json({{"folder", root()},
                              {"bus", "private"},
                              {"applications", {{{"id", sample}, {"process", application}, {"answers", true}}}},
                              {"language", "en_US"},
                              {"country", nullptr},
                              {"theme", "light"},
                              {"screen", "720x1280"}}));
    EXPECT_TRUE(fs::exists(root() + "/bus.address"));

    EXPECT_EQ(run({"stop"}), done(named(application) + " ended\n"));

    EXPECT_THAT(device_.processes(), IsEmpty());
    EXPECT_FALSE(fs::exists(root() + "/bus.address"));
    EXPECT_FALSE(fs::exists(root() + "/bus.pid"));
    EXPECT_FALSE(fs::exists(root() + "/bus"));
}

TEST_F(Start, UsesTheSessionBusWhereThereIsOne) {
    const support::PrivateBus session;
    device_.setEnvironment("DBUS_SESSION_BUS_ADDRESS", session.address());

    EXPECT_EQ(start().status, 0);

    EXPECT_EQ(device_.json({"status"})["bus"], "session");
    EXPECT_FALSE(fs::exists(root() + "/bus.address"));
    device_.must({"stop"});
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(Start, KeepsToItsPrivateBusWhereASessionBusTurnsUpLater) {
    ASSERT_EQ(start().status, 0);
    const support::PrivateBus session;
    device_.setEnvironment("DBUS_SESSION_BUS_ADDRESS", session.address());

    EXPECT_EQ(device_.json({"status"})["bus"], "private");
    EXPECT_EQ(run({"set", "language", "ko_KR"}), done());
    EXPECT_THAT(device_.must({"tree"}), testing::HasSubstr("Fruits ko_KR"));
    const pid_t application = device_.application();
    EXPECT_EQ(run({"stop"}), done(named(application) + " ended\n"));
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(Start, HappensOnceHoweverManyAskForItAtATime) {
    const auto other = device_.runInBackground({"start", "--headless", "--", sample});

    const Result result = start();

    const pid_t application = device_.application();
    if (result.status == 0) {
        EXPECT_EQ(result, done(runs(application)));
    } else {
        EXPECT_EQ(result, failed("com.example.sample runs already (process " + std::to_string(application) +
                                 "); end it with 'kest-device stop' first"));
        EXPECT_TRUE(other.outBecomes(runs(application)));
    }
    EXPECT_EQ(run({"wait-for", "text=Apple", "--timeout", "0"}), done());
    EXPECT_EQ(run({"stop"}), done(named(application) + " ended\n"));
}

TEST_F(Start, ASecondDeviceOnOneBusIsRefusedWithTheNameOfTheFirst) {
    const support::PrivateBus session;
    device_.setEnvironment("DBUS_SESSION_BUS_ADDRESS", session.address());
    test_tool::TestDevice second;
    second.setEnvironment("DBUS_SESSION_BUS_ADDRESS", session.address());
    second.must({"install", SAMPLE_PACKAGE});
    ASSERT_EQ(start().status, 0);

    EXPECT_EQ(second.run({"start", "--headless", "--", sample}), failed("this bus already has the device " + root() +
                                                                        ", which runs com.example.sample; end it with "
                                                                        "'KEST_DEVICE=" +
                                                                        root() + " kest-device stop' first"));

    EXPECT_THAT(second.processes(), IsEmpty());
    EXPECT_NE(device_.application(), 0);
}

TEST_F(Start, AnApplicationThatRunsIsLeftAsItIs) {
    ASSERT_EQ(start().status, 0);
    const pid_t application = device_.application();

    EXPECT_EQ(start(), failed("com.example.sample runs already (process " + std::to_string(application) +
                              "); end it with 'kest-device stop' first"));
    EXPECT_EQ(device_.application(), application);
}

TEST_F(Start, GivesJson) {
    const nlohmann::json started = nlohmann::json::parse(device_.must({"start", "--headless", "--json", "--", sample}));
    EXPECT_EQ(
        started,
        nlohmann::json(
            {{"application", sample}, {"process", device_.application()}, {"headless", true}, {"folder", root()}}));
}

TEST_F(Start, TheScreenIsTheOneThatIsAskedFor) {
    device_.must({"start", "--headless", "--screen", "480x800", "--", sample});

    const nlohmann::json tree = device_.json({"tree"});
    EXPECT_EQ(tree["width"], 480);
    EXPECT_EQ(tree["height"], 800);
    EXPECT_EQ(run({"get", "screen"}), done("480x800\n"));
}

TEST_F(Start, AnApplicationThatEndsAtOnceIsAnErrorWithItsLastWords) {
    EXPECT_EQ(start({"mode=fails"}),
              failed("com.example.sample ended with status 3 before it was on the screen; its last words (of " +
                     root() + "/output/com.example.sample.log): the fruits are rotten"));

    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(Start, AnApplicationThatCrashesIsAnError) {
    EXPECT_EQ(start({"mode=crashes"}),
              failed("com.example.sample ended by signal 6 (Aborted) before it was on the screen; it said nothing; "
                     "'kest-device log' may tell why"));

    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(Start, NoWordGoesThroughAShell) {
    EXPECT_EQ(start({"mode=$(touch oops)", "a=`touch oops`;touch oops"}).status, 0);

    EXPECT_FALSE(fs::exists(device_.folder() / "oops"));
    EXPECT_FALSE(fs::exists("/oops"));
}

TEST_F(Start, AKilledBusIsReplaced) {
    ASSERT_EQ(start().status, 0);
    kill(std::stoi(support::readFile(root() + "/bus.pid")), SIGKILL);
    EXPECT_EQ(run({"stop"}).status, 0);
    ASSERT_THAT(device_.processes(), IsEmpty());
    support::writeFile(root() + "/bus.address", "unix:path=" + root() + "/bus\n");
    support::writeFile(root() + "/bus.pid", "1\n");

    const Result result = start();

    EXPECT_EQ(result, done(runs(device_.application())));
}

TEST_F(Start, ADeviceDeepInTheFoldersHasABusToo) {
    device_.setRoot(std::string(120, 'd') + "/" + std::string(60, 'e'));
    device_.must({"install", SAMPLE_PACKAGE});

    EXPECT_EQ(start().status, 0);
    EXPECT_EQ(device_.json({"status"})["bus"], "private");
    const std::string address = support::readFile(root() + "/bus.address");
    const fs::path socket = address.substr(10, address.find(',') - 10);
    EXPECT_TRUE(fs::exists(socket)) << address;

    device_.must({"stop"});
    EXPECT_FALSE(fs::exists(socket.parent_path()));
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(Start, AnApplicationThatDoesNotEndIsEndedByForce) {
    ASSERT_EQ(start({"mode=deaf"}).status, 0);
    const pid_t application = device_.application();

    EXPECT_EQ(run({"stop"}), done(named(application) + " did not answer and was ended by force\n"));
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(Start, AResetIsRefusedWhileItRuns) {
    ASSERT_EQ(start().status, 0);

    EXPECT_EQ(run({"reset"}), failed("com.example.sample runs on this device; end it with 'kest-device stop' first"));
}

TEST_F(Start, AnApplicationThatRunsIsNeitherReplacedNorRemoved) {
    ASSERT_EQ(start().status, 0);

    EXPECT_EQ(run({"uninstall", sample}), failed("com.example.sample runs; end it with 'kest-device stop' first"));
    EXPECT_EQ(run({"install", SAMPLE_PACKAGE}),
              failed("com.example.sample runs; end it with 'kest-device stop' first"));
}

TEST_F(StartRefused, WithoutADisplay) {
    device_.must({"install", SAMPLE_PACKAGE});

    EXPECT_EQ(run({"start", "--", "com.example.sample"}),
              failed("there is no display to open a window on; use --headless"));
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(StartRefused, WhenItIsNotInstalled) {
    EXPECT_EQ(run({"start", "--headless", "--", "com.example.none"}),
              failed("com.example.none is not installed; what is: " + installed()));
}

TEST_F(StartRefused, WhenItsProgramIsMissing) {
    const std::string source = test_tool::makePackage(device_.folder() / "game", "com.example.game", "1");
    device_.must({"install", source});

    EXPECT_EQ(run({"start", "--headless", "--", "com.example.game"}),
              failed("com.example.game cannot start: " + root() +
                     "/opt/usr/apps/com.example.game/bin/app is no "
                     "program"));
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(StartRefused, OnAnUnknownScreen) {
    device_.must({"install", SAMPLE_PACKAGE});

    EXPECT_EQ(run({"start", "--headless", "--screen", "9x9", "--", "com.example.sample"}),
              failed("there is no screen \"9x9\"; there are 720x1280, 480x800"));
    EXPECT_THAT(device_.processes(), IsEmpty());
}

TEST_F(StartRefused, InAFolderWithABlank) {
    device_.setRoot("my device");

    EXPECT_EQ(run({"start", "--headless"}),
              failed("the device's folder \"" + root() +
                     "\" holds a blank or another character that markup cannot "
                     "carry (control characters and <>&\"'); choose another folder with KEST_DEVICE"));
}

TEST_F(StartRefused, WhereTheFolderCannotBeMade) {
    support::writeFile(device_.folder() / "file", "");
    device_.setRoot("file/device");

    const Result result = run({"start", "--headless"});

    EXPECT_EQ(result.status, 1);
    EXPECT_THAT(result.err, StartsWith("kest-device: error: " + root() + ": the device's folder cannot be made: "));
    EXPECT_EQ(std::count(result.err.begin(), result.err.end(), '\n'), 1) << result.err;
}

TEST_F(StartRefused, OnAFullDisk) {
    const FullDisk disk(2048);

    const Result result = run({"start", "--headless"});

    EXPECT_EQ(result.status, 1);
    EXPECT_THAT(result.err, StartsWith("kest-device: error: " + root() + "/device.db: "));
    EXPECT_EQ(std::count(result.err.begin(), result.err.end(), '\n'), 1) << result.err;
}

TEST_F(StartRefused, WithADamagedDatabaseWhichIsSetAside) {
    device_.must({"set", "language", "ko_KR"});
    const std::string damage = "this is no database, whatever its name says; it is long enough to have a header";
    support::writeFile(root() + "/device.db", damage);

    const Result result = run({"start", "--headless"});

    EXPECT_EQ(result.status, 1);
    EXPECT_THAT(result.err, StartsWith("kest-device: error: " + root() + "/device.db"));
    EXPECT_EQ(std::count(result.err.begin(), result.err.end(), '\n'), 1) << result.err;
    int setAside = 0;
    for (const fs::directory_entry& entry : fs::directory_iterator(root())) {
        if (entry.path().filename().string().starts_with("device.db.damaged-")) {
            ++setAside;
            EXPECT_EQ(support::readFile(entry.path()), damage);
            EXPECT_THAT(result.err, testing::HasSubstr(entry.path().string()));
        }
    }
    EXPECT_EQ(setAside, 1);
    EXPECT_EQ(run({"get", "language"}), done("en_US\n")) << "the next run has a fresh database";
}

TEST_F(StartRefused, ADeviceThatIsNotThereHasNothingToStop) {
    EXPECT_EQ(run({"stop"}), done("nothing runs: there is no device " + root() + " yet\n"));
    EXPECT_FALSE(fs::exists(root()));

    device_.must({"get"});
    EXPECT_EQ(run({"stop"}), done("nothing runs on this device\n"));
}
