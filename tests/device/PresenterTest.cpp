#include "device/Presenter.h"

#include "support/Environment.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <fcntl.h>
#include <stdexcept>
#include <string>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

namespace {

using device::Presenter;
using testing::Contains;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

/// Returns when the program is loaded, which no folder keeps from another user.
device::Process startForNobody(std::vector<std::string> words) {
    constexpr uid_t nobody = 65534;
    const int program = open(words[0].c_str(), O_PATH | O_CLOEXEC);
    std::vector<char*> pointers;
    for (std::string& word : words)
        pointers.push_back(word.data());
    pointers.push_back(nullptr);
    std::array<int, 2> loaded{};
    if (program < 0 || pipe2(loaded.data(), O_CLOEXEC) != 0)
        throw std::runtime_error("the program cannot be started for another user");
    const pid_t id = fork();
    if (id == 0) {
        if (setuid(nobody) == 0)
            fexecve(program, pointers.data(), environ);
        _exit(1);
    }
    close(program);
    close(loaded[1]);
    char none = 0;
    // Its end of the pipe closes when it has become the other program.
    while (read(loaded[0], &none, 1) > 0) {
    }
    close(loaded[0]);
    device::Process process(id);
    while (process.runs() && process.arguments().size() != words.size()) {
    }
    return process;
}

/// Another program stands in for the one that shows notifications.
class Presenting : public testing::Test {
protected:
    ~Presenting() override {
        presenter_.takeAllDown();
        while (waitpid(-1, nullptr, 0) > 0) {
        }
    }
    static std::vector<long long> idsOf(const std::vector<Presenter::Shown>& shown) {
        std::vector<long long> ids;
        for (const Presenter::Shown& each : shown)
            ids.push_back(each.id);
        return ids;
    }
    std::vector<long long> shown() const { return idsOf(presenter_.shown()); }
    static std::string environmentOf(const device::Process& process) {
        return support::readFile("/proc/" + std::to_string(process.id()) + "/environ");
    }

    support::TemporaryDevice device_;
    Presenter presenter_{device_->folder(), device_->log(), WAITING_PROGRAM};
};

TEST_F(Presenting, StartsAProgramForEachNotification) {
    presenter_.show(12);
    presenter_.show(3);
    EXPECT_THAT(shown(), ElementsAre(3, 12));
    EXPECT_THAT(presenter_.shown()[0].process.arguments(), ElementsAre(WAITING_PROGRAM, device_.root().string(), "3"));
    EXPECT_THAT(device_.logMessages(), IsEmpty());
}

TEST_F(Presenting, TellsTheProgramTheDeviceAndNoneOfThePlannedFailures) {
    const support::Environment faults("DEVICE_FAULTS", "vconf_get_str=-1");
    presenter_.show(1);
    const std::string environment = environmentOf(presenter_.shown().at(0).process);
    EXPECT_THAT(environment, HasSubstr("KEST_DEVICE=" + device_.root().string() + '\0'));
    EXPECT_THAT(environment, HasSubstr(std::string("DEVICE_FAULTS=\0", 15)));
}

TEST_F(Presenting, TakesOneDown) {
    presenter_.show(1);
    presenter_.show(2);
    presenter_.takeDown(1);
    EXPECT_THAT(shown(), ElementsAre(2));
    presenter_.takeDown(4711);
    EXPECT_THAT(shown(), ElementsAre(2));
}

TEST_F(Presenting, TakesAllDownAndSaysWhichTheyWere) {
    presenter_.show(2);
    presenter_.show(1);
    EXPECT_THAT(idsOf(presenter_.takeAllDown()), ElementsAre(1, 2));
    EXPECT_THAT(shown(), IsEmpty());
    EXPECT_THAT(idsOf(presenter_.takeAllDown()), IsEmpty());
}

TEST_F(Presenting, LeavesOtherDevicesAndOtherProgramsAlone) {
    const device::Folder folder(device_.folder() / "other");
    Presenter others(folder, device_->log(), WAITING_PROGRAM);
    others.show(1);
    Presenter elsewhere(device_->folder(), device_->log(), "/usr/bin/something-else");
    presenter_.show(1);
    EXPECT_THAT(idsOf(elsewhere.shown()), IsEmpty());
    EXPECT_THAT(idsOf(presenter_.takeAllDown()), ElementsAre(1));
    EXPECT_THAT(idsOf(others.takeAllDown()), ElementsAre(1));
}

TEST_F(Presenting, LeavesProgramsOfOtherUsersAlone) {
    if (geteuid() != 0)
        GTEST_SKIP() << "only root can start a program for another user";
    presenter_.show(1);
    const device::Process others = startForNobody({WAITING_PROGRAM, device_.root().string(), "2"});
    EXPECT_THAT(shown(), ElementsAre(1));
    EXPECT_THAT(idsOf(presenter_.takeAllDown()), ElementsAre(1));
    EXPECT_TRUE(others.runs());
    others.end();
}

TEST_F(Presenting, ShowsNoMoreThanTwentyAtOnce) {
    for (int id = 1; id <= 20; ++id)
        presenter_.show(id);
    presenter_.show(21);
    EXPECT_THAT(shown(), SizeIs(20));
    EXPECT_THAT(device_.logMessages(),
                ElementsAre("W NOTIFICATION notification 21: not shown on the desktop, which shows 20 of this device "
                            "already"));
    presenter_.takeDown(4);
    presenter_.show(22);
    EXPECT_THAT(shown(), SizeIs(20));
    EXPECT_THAT(shown(), Contains(22));
}

TEST_F(Presenting, WithoutAProgramShowsNothing) {
    Presenter none(device_->folder(), device_->log(), "");
    none.show(1);
    EXPECT_THAT(idsOf(none.shown()), IsEmpty());
    EXPECT_THAT(device_.logMessages(), IsEmpty());
}

TEST_F(Presenting, SaysWhyTheProgramCannotBeStarted) {
    Presenter missing(device_->folder(), device_->log(), "/nowhere/shows");
    missing.show(7);
    EXPECT_THAT(device_.logMessages(), ElementsAre("E NOTIFICATION notification 7: not shown on the desktop: cannot "
                                                   "start /nowhere/shows: No such file or directory"));
}

}  // namespace
