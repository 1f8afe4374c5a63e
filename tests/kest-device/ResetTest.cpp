#include "ToolTest.h"

namespace {

namespace fs = std::filesystem;

class Reset : public ToolTest {};

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
