#include "device/Process.h"

#include "support/Environment.h"
#include "support/Message.h"
#include "support/TemporaryFolder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <csignal>
#include <fcntl.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

namespace {

using device::Process;
using testing::HasSubstr;
using testing::Not;

/// A program in a folder of its own whose output can be read when it has ended.
class StartedProgram : public testing::Test {
protected:
    /// A shell script, by its path.
    std::string script(const std::string& text) {
        const auto file = folder_.path() / "program";
        support::writeFile(file, "#!/bin/sh\n" + text);
        std::filesystem::permissions(file, std::filesystem::perms::owner_all);
        return file;
    }
    Process start(std::vector<std::string> words, int inherited = -1) {
        device::Program program;
        program.words = std::move(words);
        program.output = device::Descriptor(open(output().c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600));
        program.environment = {{"CUP", "full"}};
        program.inherited = inherited;
        return device::startDetached(program);
    }
    /// What the program wrote until it ended by itself.
    std::string outputOf(const std::vector<std::string>& words, int inherited = -1) {
        const Process process = start(words, inherited);
        waitpid(process.id(), nullptr, 0);
        return support::readFile(output());
    }
    std::filesystem::path output() const { return folder_.path() / "output"; }

    support::TemporaryFolder folder_;
};

TEST_F(StartedProgram, GetsItsWordsAsTheyAre) {
    const std::string program = script("for word in \"$@\"; do echo \"[$word]\"; done\n");
    EXPECT_EQ(outputOf({program, "two words", "", "$(touch x)", "`id`", "\"'\\", "a=b;c", "*", "-n", "한국어"}),
              "[two words]\n[]\n[$(touch x)]\n[`id`]\n[\"'\\]\n[a=b;c]\n[*]\n[-n]\n[한국어]\n");
}

TEST_F(StartedProgram, StandsAlone) {
    const support::Environment variable("KETTLE", "on");
    const std::string program = script("pwd; ps -o sid= -p $$ | tr -d ' '; echo $$; echo $KETTLE $CUP; cat; exec >&2; "
                                       "echo said\n");
    const Process process = start({program});
    waitpid(process.id(), nullptr, 0);
    const std::string id = std::to_string(process.id());
    EXPECT_EQ(support::readFile(output()), "/\n" + id + "\n" + id + "\non full\nsaid\n");
}

TEST_F(StartedProgram, InheritsNoOpenFileButWhatItIsGiven) {
    const int leaked = open("/dev/null", O_RDONLY);
    const int given = open("/dev/zero", O_RDONLY);
    const std::string program =
        script("for file in 3 4 5 6 7 8 9 " + std::to_string(leaked) + " " + std::to_string(given) +
               "; do [ -e /proc/$$/fd/$file ] && readlink /proc/$$/fd/$file; done; true\n");
    // The shell reads its script by a descriptor of a higher number.
    EXPECT_THAT(outputOf({program}), Not(HasSubstr("/dev/")));
    EXPECT_THAT(outputOf({program}, given), HasSubstr("/dev/zero\n"));
    EXPECT_THAT(outputOf({program}, given), Not(HasSubstr("/dev/null")));
    close(leaked);
    close(given);
}

TEST_F(StartedProgram, HasItsSignalsAsAFreshProcess) {
    const auto before = std::signal(SIGPIPE, SIG_IGN);
    const std::string program = script("sed -n 's/^SigIgn:.//p' /proc/$$/status\n");
    // The C library keeps two of the numbers from 32 on for itself.
    EXPECT_EQ(std::stoull(outputOf({program}), nullptr, 16) & 0x7fffffff, 0U);
    std::signal(SIGPIPE, before);
}

TEST_F(StartedProgram, TellsHowItEnded) {
    const auto endOf = [this](const std::string& text) {
        const Process process = start({script(text)});
        std::optional<std::string> how;
        while (!(how = device::endOfChild(process)))
            std::this_thread::yield();
        return *how;
    };
    EXPECT_EQ(endOf("exit 3\n"), "with status 3");
    EXPECT_EQ(endOf("exit 0\n"), device::endWithStatus(0));
    EXPECT_EQ(endOf("kill -SEGV $$\n"), "by signal 11 (Segmentation fault)");
}

TEST_F(StartedProgram, IsSaidWhenItCannotBeStarted) {
    const std::string file = folder_.path() / "text";
    support::writeFile(file, "no program");
    EXPECT_EQ(support::messageOf([&] { start({file}); }), "cannot start " + file + ": Permission denied");
    std::filesystem::permissions(file, std::filesystem::perms::owner_all);
    EXPECT_EQ(support::messageOf([&] { start({file}); }), "cannot start " + file + ": Exec format error");
    EXPECT_EQ(support::messageOf([&] { start({file + "x"}); }),
              "cannot start " + file + "x: No such file or directory");
}

TEST(ProcessOfAnotherNamespace, IsNotEndedFromHere) {
    // These ids would mean a group of processes: this one's, or all.
    for (const int id : {0, -1})
        EXPECT_EQ(support::messageOf([&] { Process(id).end(); }),
                  "a process that cannot be seen from here, for example in a container, has to be ended there");
}

TEST(AProcess, CountsAsEndedWheneverItEndsWhileItIsLookedAt) {
    // The kernel takes what is left of the children at once, also between the steps of the look.
    const auto before = std::signal(SIGCHLD, SIG_IGN);
    for (int i = 0; i < 300; ++i) {
        const pid_t child = fork();
        if (child == 0)
            _exit(0);
        while (Process(child).runs()) {
        }
    }
    std::signal(SIGCHLD, before);
}

}  // namespace
