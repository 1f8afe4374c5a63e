#include "ProgramTest.h"

using testing::Contains;
using testing::ElementsAre;

namespace {

class ChosenTip : public ProgramTest {
protected:
    nlohmann::json records() { return device_.json({"usage"}); }
};

}  // namespace

TEST_F(ChosenTip, WritesOneRecordWithItsTitleAndOpensAPage) {
    start();
    const std::string title = titles()[2];

    device_.must({"tap", "--text", title});

    ASSERT_EQ(records().size(), 1U);
    EXPECT_EQ(records()[0]["values"], nlohmann::json({{"app_id", app}, {"feature", "KT01"}, {"extra", title}}));
    EXPECT_TRUE(holds("view=KestContentView"));
    EXPECT_THAT(logged("selected index"), ElementsAre("I selected index:4"));
}

TEST_F(ChosenTip, TheTitleRowCannotBeChosen) {
    start();

    device_.must({"tap", "--text", "Tips and guidelines"});

    EXPECT_EQ(records().size(), 0U);
    EXPECT_TRUE(holds("view=KestMainView"));
}

TEST_F(ChosenTip, BackLeadsToTheListAndFromThereOut) {
    start();
    device_.must({"tap", "--text", titles()[0]});

    device_.must({"key", "back"});
    EXPECT_TRUE(holds("view=KestMainView"));
    EXPECT_TRUE(holds("no-text=Back"));

    device_.must({"key", "back"});
    device_.must({"wait-for", "ended"});
}

TEST_F(ChosenTip, EscapeOnTheListEndsTheApplication) {
    start();

    device_.must({"key", "Escape"});

    device_.must({"wait-for", "ended"});
}

TEST_F(ChosenTip, APageClosesWhenTheLanguageChanges) {
    start();
    device_.must({"tap", "--text", titles()[0]});
    ASSERT_TRUE(holds("view=KestContentView"));

    device_.must({"set", "language", "ko_KR"});

    EXPECT_TRUE(holds("view=KestMainView"));
    EXPECT_TRUE(holds("text=팁과 사용 안내"));
}

TEST_F(ChosenTip, APageClosesWhenAnApplicationIsInstalled) {
    start();
    device_.must({"tap", "--text", titles()[0]});

    device_.must({"install", makeSleepPackage(device_.folder() / "sleep")});

    EXPECT_TRUE(holds("view=KestMainView"));
    EXPECT_THAT(titles(), Contains("Sleep tight"));
}
