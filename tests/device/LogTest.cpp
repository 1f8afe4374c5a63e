#include "device/Log.h"

#include "support/Environment.h"
#include "support/Process.h"
#include "support/TemporaryFolder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fcntl.h>
#include <map>
#include <sstream>
#include <sys/resource.h>

namespace {

using device::Log;
using support::Process;
using support::readFile;
using support::TemporaryFolder;
using support::writeFile;
using testing::MatchesRegex;

class LogFile : public testing::Test {
protected:
    /// What the message became, without time, level and process.
    std::string written(std::string_view message) {
        std::filesystem::remove(file);
        EXPECT_TRUE(log.write(Log::Level::Info, "TAG", message));
        const std::string line = readFile(file);
        const std::string prefix = "I TAG(" + std::to_string(getpid()) + ") ";
        const std::size_t begin = line.find(prefix);
        return begin == std::string::npos ? "no line" : line.substr(begin + prefix.size());
    }

    TemporaryFolder folder;
    std::filesystem::path file = folder.path() / "device.log";
    Log log{file};
};

TEST_F(LogFile, HoldsOneLineACall) {
    EXPECT_TRUE(log.write(Log::Level::Debug, "ONE", "first"));
    EXPECT_TRUE(log.write(Log::Level::Fatal, "TWO", ""));
    const std::string time = "[0-9]+-[0-9]+-[0-9]+ [0-9]+:[0-9]+:[0-9]+\\.[0-9][0-9][0-9]";
    const std::string process = "\\(" + std::to_string(getpid()) + "\\)";
    EXPECT_THAT(readFile(file),
                MatchesRegex(time + " D ONE" + process + " first\n" + time + " F TWO" + process + " \n"));
}

TEST_F(LogFile, NamesEveryLevelByItsLetter) {
    using Level = Log::Level;
    for (const Level level : {Level::Debug, Level::Info, Level::Warning, Level::Error, Level::Fatal})
        EXPECT_TRUE(log.write(level, "T", "m"));
    std::string letters;
    std::istringstream lines(readFile(file));
    for (std::string line; std::getline(lines, line);)
        letters += line.at(sizeof("2026-01-31 12:00:00.123"));
    EXPECT_EQ(letters, "DIWEF");
}

TEST_F(LogFile, ShowsControlCharactersButKeepsColours) {
    using namespace std::string_view_literals;
    EXPECT_EQ(written("two\nlines"), "two\\nlines\n");
    EXPECT_EQ(written("a\0b\rc\td\x7f"sv), "a\\x00b\\x0dc\\x09d\\x7f\n");
    EXPECT_EQ(written("\x1b[0;32mgreen\x1b[0;m"), "\x1b[0;32mgreen\x1b[0;m\n");
    EXPECT_EQ(written("\x1b[2Jclears the screen\x1b"), "\\x1b[2Jclears the screen\\x1b\n");
    EXPECT_EQ(written("한국어 \xff"), "한국어 \xff\n");
}

TEST_F(LogFile, KeepsALongMessageWhole) {
    const std::string message(1024 * 1024, 'x');
    EXPECT_EQ(written(message), message + "\n");
}

TEST_F(LogFile, IsForItsUserOnly) {
    written("message");
    EXPECT_EQ(std::filesystem::status(file).permissions(), std::filesystem::perms(0600));
}

TEST_F(LogFile, GivesWayToAFreshOneWhenItIsFull) {
    writeFile(file, std::string(4 * 1024 * 1024 - 10, 'x'));
    writeFile(file.string() + ".1", "older");
    EXPECT_TRUE(log.write(Log::Level::Info, "TAG", "the first line of the fresh file"));
    EXPECT_EQ(std::filesystem::file_size(file.string() + ".1"), 4U * 1024 * 1024 - 10);
    EXPECT_THAT(readFile(file), MatchesRegex("[^\n]+ I TAG\\([0-9]+\\) the first line of the fresh file\n"));
}

TEST_F(LogFile, StaysWhileThereIsRoom) {
    writeFile(file, std::string(4 * 1024 * 1024 - 1000, 'x'));
    EXPECT_TRUE(log.write(Log::Level::Info, "TAG", "message"));
    EXPECT_FALSE(std::filesystem::exists(file.string() + ".1"));
}

TEST_F(LogFile, LosesNoLineAndMixesNoneWhenProcessesShareIt) {
    // 4 times 1.5 MB: it becomes full once while they write.
    constexpr int processes = 4;
    constexpr int lines = 1500;
    std::vector<Process> writers;
    writers.reserve(processes);
    for (int number = 0; number < processes; ++number)
        writers.push_back(Process::ofWork([&, number] {
            Log same(file);
            for (int line = 0; line < lines; ++line)
                if (!same.write(Log::Level::Info, "TAG",
                                std::to_string(number) + " " + std::to_string(line) + " " + std::string(1000, 'x')))
                    return 1;
            return 0;
        }));
    for (Process& writer : writers)
        EXPECT_EQ(writer.wait(), 0);

    std::map<std::string, int> counts;
    std::istringstream all(readFile(file.string() + ".1") + readFile(file));
    for (std::string line; std::getline(all, line);) {
        const std::size_t begin = line.find(") ");
        ASSERT_NE(begin, std::string::npos) << line;
        const std::string message = line.substr(begin + 2);
        ASSERT_EQ(message.substr(message.rfind(' ') + 1), std::string(1000, 'x'));
        ++counts[message.substr(0, message.rfind(' '))];
    }
    EXPECT_EQ(counts.size(), static_cast<std::size_t>(processes * lines));
    for (const auto& [message, count] : counts)
        EXPECT_EQ(count, 1) << message;
}

TEST(Log, SaysThatALineCouldNotBeWritten) {
    const TemporaryFolder folder;
    EXPECT_FALSE(Log(folder.path() / "missing/device.log").write(Log::Level::Info, "TAG", "message"));
    EXPECT_FALSE(Log(folder.path()).write(Log::Level::Info, "TAG", "message"));
    EXPECT_FALSE(Log("/dev/full").write(Log::Level::Info, "TAG", "message"));
}

TEST(Log, DoesNotWaitForTheReaderOfAPipe) {
    const TemporaryFolder folder;
    ASSERT_EQ(mkfifo((folder.path() / "device.log").c_str(), 0600), 0);
    EXPECT_FALSE(Log(folder.path() / "device.log").write(Log::Level::Info, "TAG", "message"));
}

TEST(Log, IsEchoedOnATerminalOnly) {
    const TemporaryFolder folder;
    testing::internal::CaptureStderr();
    Log(folder.path() / "device.log").write(Log::Level::Info, "TAG", "message");
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");

    const int terminal = posix_openpt(O_RDWR | O_NOCTTY);
    ASSERT_GE(terminal, 0);
    ASSERT_EQ(grantpt(terminal) | unlockpt(terminal), 0);
    const std::string other = ptsname(terminal);
    auto writer = Process::ofWork([&] {
        dup2(open(other.c_str(), O_RDWR | O_NOCTTY), STDERR_FILENO);
        return Log(folder.path() / "other.log").write(Log::Level::Info, "TAG", "message") ? 0 : 1;
    });
    char shown[200] = {};
    const ssize_t length = read(terminal, shown, sizeof shown - 1);
    EXPECT_EQ(writer.wait(), 0);
    close(terminal);
    ASSERT_GT(length, 0);
    EXPECT_THAT(std::string(shown, static_cast<std::size_t>(length)), MatchesRegex(".* I TAG\\([0-9]+\\) message\r\n"));
}

}  // namespace
