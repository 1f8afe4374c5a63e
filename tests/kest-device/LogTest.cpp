#include "ToolTest.h"

#include "device/Log.h"

namespace {

using Level = device::Log::Level;

class LogCommand : public ToolTest {
protected:
    void SetUp() override { std::filesystem::create_directory(device_.root()); }

    void write(const std::string& line) { writeTo(device_.root() / "device.log", line); }
    static void writeTo(const std::filesystem::path& file, const std::string& line) {
        std::ofstream(file, std::ios::app) << line << '\n';
    }

    const std::string info_ = "2026-01-31 12:00:00.123 I KEST(47) \x1b[0;32mhello (1) world\x1b[0;m";
    const std::string plain_ = "2026-01-31 12:00:00.123 I KEST(47) hello (1) world";
    const std::string warning_ = "2026-01-31 12:00:01.000 W EFL(47) careful";
    const std::string error_ = "2026-01-31 12:00:02.000 E KEST(47) broken";
};

}  // namespace

TEST_F(LogCommand, PrintsTheLinesWithoutColoursWhereThereIsNoTerminal) {
    write(info_);
    write(error_);

    EXPECT_EQ(run({"log"}), done(plain_ + "\n" + error_ + "\n"));
}

TEST_F(LogCommand, ReadsWhatTheDeviceWrites) {
    device::Log log(device_.root() / "device.log");
    ASSERT_TRUE(log.write(Level::Warning, "TAG", "a message"));

    const nlohmann::json line = device_.json({"log"});

    EXPECT_EQ(line["level"], "W");
    EXPECT_EQ(line["tag"], "TAG");
    EXPECT_EQ(line["process"], getpid());
    EXPECT_EQ(line["message"], "a message");
    EXPECT_EQ(line["time"].get<std::string>().size(), 23U);
}

TEST_F(LogCommand, BeginsWithTheFileBefore) {
    writeTo(device_.root() / "device.log.1", warning_);
    write(error_);

    EXPECT_EQ(run({"log"}), done(warning_ + "\n" + error_ + "\n"));
}

TEST_F(LogCommand, LeavesOutWhatIsLessImportant) {
    write(info_);
    write(warning_);
    write(error_);

    EXPECT_EQ(run({"log", "--level", "warning"}), done(warning_ + "\n" + error_ + "\n"));
    EXPECT_EQ(run({"log", "--level", "E"}), done(error_ + "\n"));
}

TEST_F(LogCommand, LeavesOutOtherTags) {
    write(info_);
    write(warning_);

    EXPECT_EQ(run({"log", "--tag", "EFL"}), done(warning_ + "\n"));
}

TEST_F(LogCommand, GivesOneJsonObjectALine) {
    write(info_);
    write("not a line of the log");

    EXPECT_EQ(run({"log", "--json"}),
              done("{\"time\":\"2026-01-31 12:00:00.123\",\"level\":\"I\",\"tag\":\"KEST\",\"process\":47,"
                   "\"message\":\"hello (1) world\"}\n{\"message\":\"not a line of the log\"}\n"));
}

TEST_F(LogCommand, LinesThatAreNoneAreLeftOutOnlyWhenSomethingIsAskedFor) {
    write("not a line of the log");

    EXPECT_EQ(run({"log"}), done("not a line of the log\n"));
    EXPECT_EQ(run({"log", "--tag", "KEST"}), done());
}

TEST_F(LogCommand, IsEmptyWithoutALog) {
    EXPECT_EQ(run({"log"}), done());
}

TEST_F(LogCommand, FollowsTheLogAlsoWhenItBeginsAnew) {
    write(info_);
    const test_tool::BackgroundRun log = device_.runInBackground({"log", "-f"});
    ASSERT_TRUE(log.outBecomes(plain_ + "\n")) << log.out();

    write(warning_);
    ASSERT_TRUE(log.outBecomes(plain_ + "\n" + warning_ + "\n")) << log.out();

    std::filesystem::rename(device_.root() / "device.log", device_.root() / "device.log.1");
    write(error_);
    EXPECT_TRUE(log.outBecomes(plain_ + "\n" + warning_ + "\n" + error_ + "\n")) << log.out();
}
