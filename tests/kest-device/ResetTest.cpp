#include "ToolTest.h"

#include "device/ApplicationLock.h"

#include <fcntl.h>
#include <future>
#include <poll.h>
#include <sys/file.h>

namespace {

namespace fs = std::filesystem;

class Reset : public ToolTest {
protected:
    /// Whether one of the device's processes has the file open.
    bool isOpen(const fs::path& file) const {
        for (const pid_t process : device_.processes()) {
            std::error_code error;
            for (const auto& entry : fs::directory_iterator("/proc/" + std::to_string(process) + "/fd", error)) {
                if (fs::read_symlink(entry.path(), error) == file) {
                    return true;
                }
            }
        }
        return false;
    }
};

}  // namespace

TEST_F(Reset, MakesTheDeviceAsNew) {
    device_.must({"set", "language", "ko_KR"});
    device_.must({"install", test_tool::makePackage(device_.folder() / "game", "com.example.game", "1")});
    device::Log(device_.root() / "device.log").write(device::Log::Level::Info, "TAG", "a message");
    device_.open().launches().append({"a.a", "b.b", {}}, device::LaunchOutcome::Started);
    support::writeFile(device_.root() / "output/b.b.log", "the last words");

    EXPECT_EQ(run({"reset"}), done("the device " + root() +
                                   " is as new; removed: device.db device.log output toolkit com.example.game\n"));

    EXPECT_EQ(run({"get", "language"}), done("en_US\n"));
    EXPECT_EQ(run({"log"}), done());
    EXPECT_EQ(run({"launches"}), done());
    EXPECT_FALSE(fs::exists(device_.root() / "opt/usr/apps/com.example.game"));
}

TEST_F(Reset, LeavesWhatIsNotTheDevices) {
    device_.must({"get"});
    support::writeFile(device_.root() / "notes.txt", "mine");
    support::writeFile(device_.root() / "opt/usr/apps/notes.txt", "mine");
    support::writeFile(device_.root() / "device.db.damaged-2026", "old");

    device_.must({"reset"});

    EXPECT_EQ(support::readFile(device_.root() / "notes.txt"), "mine");
    EXPECT_EQ(support::readFile(device_.root() / "opt/usr/apps/notes.txt"), "mine");
    EXPECT_EQ(support::readFile(device_.root() / "device.db.damaged-2026"), "old");
}

TEST_F(Reset, HelpsWithADamagedDatabase) {
    device_.must({"get"});
    support::writeFile(device_.root() / "device.db", std::string(4096, 'x'));

    EXPECT_EQ(run({"reset"}).status, 0);

    EXPECT_EQ(run({"get", "language"}), done("en_US\n"));
}

TEST_F(Reset, CuresWhatOneThatWasCutShortHasLeft) {
    const fs::path apps = device_.root() / "opt/usr/apps";
    const std::string before = device_.must({"packages"});
    ASSERT_THAT(before, testing::HasSubstr("com.ravella.clock"));
    support::writeFile(apps / "com.ravella.clock/shared/res/clock.png", "the rest of a package");
    test_tool::makePackage(apps / ".removing-abcdef/com.example.game", "com.example.game", "1");
    test_tool::makePackage(apps / ".installing-abcdef", "com.example.game", "1");

    EXPECT_EQ(run({"packages"}), done(before));
    device_.must({"reset"});

    EXPECT_EQ(run({"packages"}), done(before));
    EXPECT_FALSE(fs::exists(apps / ".removing-abcdef"));
    EXPECT_FALSE(fs::exists(apps / ".installing-abcdef"));
}

TEST_F(Reset, IsRefusedForAnApplicationThatComesUpMeanwhile) {
    device_.must({"set", "language", "ko_KR"});
    const device::Folder folder(device_.root());
    device::Descriptor held(open(folder.databaseLock().c_str(), O_RDWR | O_CLOEXEC));
    ASSERT_EQ(flock(held.get(), LOCK_EX), 0);
    auto result = std::async(std::launch::async, [&] { return run({"reset"}); });
    for (int attempt = 0; attempt < 1000 && !isOpen(folder.databaseLock()); ++attempt) {
        poll(nullptr, 0, 2);
    }
    EXPECT_TRUE(isOpen(folder.databaseLock())) << "it has seen that nothing runs, and waits";
    {
        const device::ApplicationLock comingUp(folder, "com.example.app");
        held = device::Descriptor();
        EXPECT_EQ(result.get(), failed("com.example.app runs on this device; end it with 'kest-device stop' first"));
    }
    EXPECT_EQ(run({"get", "language"}), done("ko_KR\n"));
}
