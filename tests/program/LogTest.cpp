#include "ProgramTest.h"

using testing::Each;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

class ProgramLog : public ProgramTest {};

}  // namespace

TEST_F(ProgramLog, TellsTheLoadOfTheCatalogue) {
    start();

    EXPECT_THAT(logged("BEGIN >>>>"), Each("I BEGIN >>>>"));
    EXPECT_THAT(logged("BEGIN >>>>"), SizeIs(testing::Gt(2U)));
    EXPECT_THAT(logged("__loadMainMenu failed"), testing::ElementsAre("W __loadMainMenu failed : com.ravella.sleep"));
    EXPECT_THAT(device_.must({"log", "--tag", "KEST", "--level", "error"}), IsEmpty());
}

TEST_F(ProgramLog, NamesTheSourceTheFunctionAndTheLine) {
    start();

    EXPECT_THAT(
        device_.must({"log", "--tag", "KEST", "--level", "warning"}),
        testing::ContainsRegex("^[-0-9]+ [0-9:.]+ W KEST\\([0-9]+\\) [A-Za-z]+\\.cpp: __loadMainMenu\\([0-9]+\\) > "
                               "__loadMainMenu failed : com\\.ravella\\.sleep\n$"));
}

TEST_F(ProgramLog, HasNoComplaintOfTheToolkit) {
    start();
    device_.must({"tap", "--text", titles()[0]});
    device_.must({"key", "back"});
    device_.must({"set", "theme", "dark"});
    device_.must({"set", "language", "ko_KR"});
    device_.must({"stop"});

    EXPECT_EQ(device_.must({"log", "--tag", "EFL", "--level", "warning"}), "");
}
