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

TEST_F(WrongUsage, RowsThatAreNoNumber) {
    EXPECT_EQ(run({"wait-for", "rows=-1"}), wrongUsage("the condition \"rows=-1\" needs a number after its \"=\"; see "
                                                       "'kest-device wait-for --help'"));
}

TEST_F(WrongUsage, ASwipeThatTakesNoTimeOrForEver) {
    for (const char* seconds : {"0", "11", "-1", "nan"}) {
        EXPECT_EQ(run({"swipe", "1", "1", "2", "2", "--seconds", seconds}),
                  wrongUsage("a swipe takes from 0.01 to 10 seconds; see 'kest-device swipe --help'"))
            << seconds;
    }
}

TEST_F(WrongUsage, FilesWithoutAName) {
    EXPECT_EQ(run({"install", ""}), wrongUsage("the package's folder has no name; see 'kest-device install --help'"));
    EXPECT_EQ(run({"screenshot", ""}),
              wrongUsage("the picture's file has no name; see 'kest-device screenshot --help'"));
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
    EXPECT_EQ(run({"launch", "com.ravella.kest", "page"}),
              wrongUsage("extras are written KEY=VALUE; \"page\" is not; see 'kest-device launch --help'"));
    EXPECT_EQ(run({"launch", "com.ravella.kest", "page=1", "page=2"}),
              wrongUsage("the extra \"page\" is given twice; see 'kest-device launch --help'"));
    EXPECT_EQ(run({"launch", "com.ravella.kest", "page=" + std::string(70000, '1')}),
              wrongUsage("the request is larger than 64 KiB; see 'kest-device launch --help'"));
    EXPECT_EQ(run({"launch"}), wrongUsage("request is required; see 'kest-device launch --help'"));
}

TEST_F(WrongUsage, AnApplicationIdThatIsNone) {
    EXPECT_EQ(run({"start", "--headless", "--", "../kest"}),
              wrongUsage("\"../kest\" is no application id: part 1 of it is empty; see 'kest-device start --help'"));
    EXPECT_EQ(run({"launch", "com..kest"}),
              wrongUsage("\"com..kest\" is no application id: part 2 of it is empty; see 'kest-device launch --help'"));
    EXPECT_EQ(run({"launch", "1com.kest"}),
              wrongUsage("\"1com.kest\" is no application id: part 1 of it, \"1com\", begins "
                         "with a digit; see 'kest-device launch --help'"));
    EXPECT_EQ(
        run({"tree", "--app", "com.ke$t"}),
        wrongUsage("\"com.ke$t\" is no application id: part 2 of it, \"ke$t\", holds \"$\"; only letters, digits, "
                   "\"-\" and \"_\" may stand there; see 'kest-device tree --help'"));
    for (const char* command : {"uninstall", "clear", "preferences"})
        EXPECT_EQ(run({command, "kest"}),
                  wrongUsage("\"kest\" is no application id: it has no dot; it needs two or more "
                             "parts, joined by dots; see 'kest-device " +
                             std::string(command) + " --help'"));
}

TEST_F(WrongUsage, WordsThatAreNotUtf8) {
    EXPECT_EQ(run({"tap", "--text", "\xff"}), wrongUsage("argument 3 is not UTF-8"));
}
