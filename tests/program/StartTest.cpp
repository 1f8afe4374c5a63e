#include "ProgramTest.h"

#include "support/FullDisk.h"
#include "support/PrivateBus.h"

#include <csignal>
#include <fcntl.h>

using test_tool::done;
using test_tool::failed;
using testing::IsEmpty;

namespace {

class Program : public ProgramTest {};

}  // namespace

TEST_F(Program, LeavesNothingBehindWhenItIsStopped) {
    start();
    EXPECT_NE(device_.application(), 0);

    device_.must({"stop"});

    EXPECT_THAT(device_.processes(), IsEmpty());
    EXPECT_FALSE(std::filesystem::exists(device_.root() / "bus.address"));
}

TEST_F(Program, StartsAgainAfterItWasKilled) {
    start();
    const std::vector<std::string> before = titles();
    kill(device_.application(), SIGKILL);
    device_.must({"wait-for", "ended"});

    start();

    EXPECT_EQ(titles(), before);
}

TEST_F(Program, RunsBesideAnotherDevice) {
    test_tool::TestDevice other;
    other.must({"set", "language", "ko_KR"});
    start();
    other.must({"start", "--headless"});

    other.must({"set", "language", "ru_RU"});

    EXPECT_EQ(titleBar(), "Tips");
    EXPECT_EQ(other.run({"wait-for", "text=Советы", "--timeout", "0"}), done());
}

TEST_F(Program, IsRefusedOnABusThatHasAnotherDevice) {
    const support::PrivateBus session;
    device_.setEnvironment("DBUS_SESSION_BUS_ADDRESS", session.address());
    test_tool::TestDevice other;
    other.setEnvironment("DBUS_SESSION_BUS_ADDRESS", session.address());
    start();

    EXPECT_EQ(other.run({"start", "--headless"}), failed("this bus already has the device " + device_.root().string() +
                                                         ", which runs com.ravella.kest; "
                                                         "end it with 'KEST_DEVICE=" +
                                                         device_.root().string() + " kest-device stop' first"));
}

TEST_F(Program, StartedByHandWithoutABusSaysSoAndRunsOn) {
    const std::filesystem::path out = device_.folder() / "said";
    std::filesystem::create_directories(device_.root());
    std::filesystem::create_directory_symlink(device_.root(), device_.folder() / "link");
    const support::Environment folder("KEST_DEVICE", (device_.folder() / "link/").string());
    const support::Environment home("HOME", device_.folder().string());
    const support::Environment engine("ELM_ENGINE", "buffer");
    const support::Environment bus("DBUS_SESSION_BUS_ADDRESS", std::nullopt);
    support::Process program = support::Process::ofWork([&] {
        const int file = open(out.c_str(), O_WRONLY | O_CREAT, 0600);
        dup2(file, STDOUT_FILENO);
        dup2(file, STDERR_FILENO);
        execl(KEST_PROGRAM, "kest", nullptr);
        return 127;
    });

    // The tool finds it, though no bus leads to it and its environment names the folder in another way.
    while (device_.json({"status"})["applications"].empty() || support::readFile(out).empty()) {
        poll(nullptr, 0, 20);
    }
    EXPECT_EQ(support::readFile(out), "kest: there is no bus: remote control is off\n");
    EXPECT_EQ(device_.run({"tap", "1", "1"}), failed("com.ravella.kest (process " + std::to_string(program.id()) +
                                                     ") does not answer; end it with 'kest-device stop'"));
    EXPECT_EQ(device_.run({"reset"}),
              failed("com.ravella.kest runs on this device; end it with 'kest-device stop' first"));
    program.end(SIGTERM);
}

TEST_F(Program, OnADiskThatFillsUpDuringItsFirstStartShowsItsListAtALaterOne) {
    start();
    const std::vector<std::string> whole = titles();

    // From a disk on which hardly the database fits to one that the last texts do not fit on.
    for (const rlim_t kilobytes : {38, 40, 44, 60, 80}) {
        test_tool::TestDevice full;
        {
            const support::FullDisk disk(kilobytes * 512);
            full.run({"start", "--headless"});
        }
        full.must({"stop"});
        full.must({"start", "--headless"});
        const std::string tree = full.must({"tree"});
        for (const std::string& title : whole)
            EXPECT_THAT(tree, testing::HasSubstr(title)) << kilobytes;
    }
}
