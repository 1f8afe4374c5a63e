#include "ToolTest.h"

namespace {

class WrongUsage : public ToolTest {};

}  // namespace

TEST_F(WrongUsage, NoCommand) {
    EXPECT_EQ(run({}), wrongUsage("a command is missing; see 'kest-device --help'"));
}

TEST_F(WrongUsage, UnknownCommand) {
    EXPECT_EQ(run({"dance"}), wrongUsage("there is no command \"dance\"; see 'kest-device --help'"));
}

TEST_F(WrongUsage, UnknownOption) {
    EXPECT_EQ(run({"status", "--fast"}),
              wrongUsage("The following argument was not expected: --fast; see 'kest-device status --help'"));
}

TEST_F(WrongUsage, MissingWord) {
    EXPECT_EQ(run({"set", "language"}), wrongUsage("value is required; see 'kest-device set --help'"));
}

TEST_F(WrongUsage, APlaceIsTwoNumbers) {
    EXPECT_EQ(run({"tap", "1"}), wrongUsage("tap needs either X and Y or --text; see 'kest-device tap --help'"));
    EXPECT_EQ(run({"tap", "1", "two"}), wrongUsage("Could not convert: y = two; see 'kest-device tap --help'"));
    EXPECT_EQ(run({"swipe", "1", "2", "3"}), wrongUsage("y2 is required; see 'kest-device swipe --help'"));
}

TEST_F(WrongUsage, ATapNeedsOneTarget) {
    EXPECT_EQ(run({"tap"}), wrongUsage("tap needs either X and Y or --text; see 'kest-device tap --help'"));
    EXPECT_EQ(run({"tap", "1", "2", "--text", "A"}),
              wrongUsage("tap needs either X and Y or --text; see 'kest-device tap --help'"));
}

TEST_F(WrongUsage, AnUnknownCondition) {
    const std::string rest = "; there are text=TEXT, no-text=TEXT, view=NAME, rows=NUMBER, log=TEXT, usage=VALUE and "
                             "ended; see 'kest-device wait-for --help'";

    EXPECT_EQ(run({"wait-for", "sunshine"}), wrongUsage("there is no condition \"sunshine\"" + rest));
    EXPECT_EQ(run({"wait-for", "log="}), wrongUsage("there is no condition \"log=\"" + rest));
}

TEST_F(WrongUsage, AnUnknownLevel) {
    EXPECT_EQ(run({"log", "--level", "loud"}),
              wrongUsage("there is no level \"loud\"; there are debug, info, warning, error and fatal; see "
                         "'kest-device log --help'"));
}

TEST_F(WrongUsage, ExtrasThatAreNone) {
    EXPECT_EQ(run({"start", "--headless", "--", "com.ravella.kest", "page"}),
              wrongUsage("extras are written KEY=VALUE; \"page\" is not; see 'kest-device start --help'"));
    EXPECT_EQ(run({"start", "--headless", "--", "com.ravella.kest", "=1"}),
              wrongUsage("extras are written KEY=VALUE; \"=1\" is not; see 'kest-device start --help'"));
}

TEST_F(WrongUsage, AnApplicationIdThatIsNone) {
    EXPECT_EQ(run({"start", "--headless", "--", "../kest"}),
              wrongUsage("\"../kest\" is no application id; see 'kest-device start --help'"));
}

TEST_F(WrongUsage, WordsThatAreNotUtf8) {
    EXPECT_EQ(run({"tap", "--text", "\xff"}), wrongUsage("argument 3 is not UTF-8"));
}
