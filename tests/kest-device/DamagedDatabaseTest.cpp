#include "ToolTest.h"

using testing::IsEmpty;
using testing::SizeIs;

namespace {

namespace fs = std::filesystem;

class DamagedDatabase : public SampleToolTest {
protected:
    void damage() {
        device_.open().database().sql().exec("PRAGMA wal_checkpoint(TRUNCATE)");
        std::string bytes = support::readFile(file());
        ASSERT_GT(bytes.size(), 3200U);
        bytes.replace(200, 3000, 3000, '\xee');
        support::writeFile(file(), bytes);
    }
    std::string file() const { return root() + "/device.db"; }
    /// Without the logs that go with them.
    std::vector<std::string> setAside() const {
        std::vector<std::string> files;
        for (const fs::directory_entry& entry : fs::directory_iterator(root())) {
            const std::string name = entry.path().filename();
            if (name.starts_with("device.db.damaged-") && name.ends_with("Z")) {
                files.push_back(entry.path());
            }
        }
        return files;
    }
    Result inUse() const {
        return failed(file() + ": is damaged (database disk image is malformed) while com.example.sample runs on it; "
                               "end that application, then try again; 'kest-device stop' ends it");
    }
};

}  // namespace

TEST_F(DamagedDatabase, IsLeftToTheApplicationThatRunsOnItUntilThatIsStopped) {
    ASSERT_EQ(start().status, 0);
    const pid_t application = device_.application();
    damage();
    const std::string damaged = support::readFile(file());

    for (const std::vector<std::string>& command : {std::vector<std::string>{"get"},
                                                    {"set", "language", "ko_KR"},
                                                    {"status"},
                                                    {"packages"},
                                                    {"start", "--headless", "--", sample}}) {
        EXPECT_EQ(run(command), inUse()) << command.front();
    }
    EXPECT_EQ(run({"reset"}), failed("com.example.sample runs on this device; end it with 'kest-device stop' first"));
    EXPECT_EQ(support::readFile(file()), damaged);
    EXPECT_THAT(setAside(), IsEmpty());
    EXPECT_EQ(run({"wait-for", "text=Apple", "--timeout", "0"}), done()) << "the application answers all the same";

    EXPECT_EQ(run({"stop"}), done("com.example.sample (process " + std::to_string(application) + ") ended\n"));
    EXPECT_THAT(device_.processes(), IsEmpty());
    EXPECT_THAT(setAside(), IsEmpty());
    EXPECT_EQ(run({"get", "language"}).status, 1);
    EXPECT_THAT(setAside(), SizeIs(1));
    EXPECT_EQ(run({"get", "language"}), done("en_US\n"));
    EXPECT_EQ(start().status, 0);
}

TEST_F(DamagedDatabase, OfADeviceOnWhichNothingRunsIsNoneOfStopsBusiness) {
    damage();
    EXPECT_EQ(run({"stop"}), done("nothing runs on this device\n"));
    EXPECT_THAT(setAside(), IsEmpty());
}

TEST_F(DamagedDatabase, IsSetAsideByAReset) {
    damage();
    const std::string damaged = support::readFile(file());
    EXPECT_EQ(run({"reset"}).status, 0);
    ASSERT_THAT(setAside(), SizeIs(1));
    EXPECT_EQ(support::readFile(setAside().front()), damaged);
}

TEST_F(DamagedDatabase, TakesNoInstalledPackageAlong) {
    damage();
    EXPECT_EQ(run({"packages"}).status, 1);
    EXPECT_THAT(device_.must({"packages"}), testing::HasSubstr(sample));
    const std::string other = test_tool::makePackage(device_.folder() / "game", "com.example.game", "1");

    EXPECT_EQ(run({"install", other}), done("installed com.example.game 1\n"));

    EXPECT_THAT(device_.must({"packages"}), testing::HasSubstr(sample));
    EXPECT_EQ(start().status, 0);
}
