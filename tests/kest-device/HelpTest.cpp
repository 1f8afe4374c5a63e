#include "ToolTest.h"

namespace {

/// The help that a person reads, kept whole in the folder help/.
class Help : public ToolTest, public testing::WithParamInterface<std::string> {};

std::string kept(const std::string& name) {
    return support::readFile(std::filesystem::path(HELP_FOLDER) / (name + ".txt"));
}

}  // namespace

TEST_P(Help, OfACommandIsAsItWasWritten) {
    EXPECT_EQ(run({GetParam(), "--help"}), done(kept(GetParam())));
}

INSTANTIATE_TEST_SUITE_P(Commands, Help,
                         testing::Values("start", "launch", "stop", "status", "reset", "get", "set", "unset", "install",
                                         "uninstall", "packages", "clear", "preferences", "usage", "launches",
                                         "notifications", "log", "tree", "tap", "swipe", "key", "wait-for",
                                         "screenshot"),
                         [](const auto& information) {
                             std::string name = information.param;
                             std::erase(name, '-');
                             return name;
                         });

TEST_F(Help, OfTheToolListsItsCommands) {
    EXPECT_EQ(run({"--help"}), done(kept("kest-device")));
}

TEST_F(Help, TellsTheVersion) {
    EXPECT_EQ(run({"--version"}), done("kest-device " PROJECT_VERSION "\n"));
}

TEST_F(Help, OpensNoDevice) {
    device_.must({"start", "--help"});

    EXPECT_FALSE(std::filesystem::exists(device_.root()));
}
