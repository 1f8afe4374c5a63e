#include "ProgramTest.h"

#include <set>
#include <sstream>

using testing::Contains;
using testing::IsEmpty;
using testing::Not;
using testing::SizeIs;

namespace {

class TipsList : public ProgramTest {};

}  // namespace

TEST_F(TipsList, ShowsATitleRowAndARowForEachMenuOfTheRegion) {
    start();

    EXPECT_EQ(titleBar(), "Tips");
    EXPECT_EQ(titleRow(), "Tips and guidelines");
    ASSERT_THAT(rows(), SizeIs(menusOfferedIn("Global").size()));
    for (const ListRow& row : rows()) {
        EXPECT_NE(row.top, "");
        EXPECT_NE(row.bottom, "");
        EXPECT_NE(row.bottom, "No Title");
    }
}

TEST_F(TipsList, TheRowsInSightHaveTheIconsOfTheirApplications) {
    start();

    const std::vector<ListRow> shown = rows();
    ASSERT_GE(shown.size(), 6U);
    for (std::size_t i = 0; i < 6; ++i) {
        EXPECT_TRUE(shown[i].hasIcon) << shown[i].bottom;
    }
}

TEST_F(TipsList, AnotherCountryAndARestartChangeWhichMenusShow) {
    start();
    const std::vector<std::string> global = titles();
    EXPECT_THAT(global, SizeIs(menusOfferedIn("Global").size()));

    device_.must({"set", "country", "IN"});
    EXPECT_EQ(titles(), global) << "a running list keeps its menus until it loads anew";
    restart();

    EXPECT_THAT(titles(), SizeIs(menusOfferedIn("India").size()));
    EXPECT_THAT(titles(), Not(Contains("")));
    EXPECT_NE(titles(), global);
}

TEST_F(TipsList, AnotherLanguageIsOnTheRunningListWhenTheCommandComesBack) {
    start();
    const std::vector<std::string> english = titles();

    device_.must({"set", "language", "ko_KR"});

    EXPECT_EQ(titleBar(), "팁");
    EXPECT_EQ(titleRow(), "팁과 사용 안내");
    const std::vector<std::string> korean = titles();
    ASSERT_THAT(korean, SizeIs(english.size()));
    for (std::size_t i = 0; i < english.size(); ++i) {
        EXPECT_NE(korean[i], english[i]);
    }

    device_.must({"set", "language", "en_US"});
    EXPECT_EQ(titles(), english);
}

TEST_F(TipsList, StartsInTheDevicesLanguage) {
    device_.must({"set", "language", "ru_RU"});
    start();

    EXPECT_EQ(titleBar(), "Советы");
    EXPECT_EQ(device_.json({"preferences", app})[app]["KestCurrentLanguage"], "ru_RU.UTF-8");
}

TEST_F(TipsList, AnInstalledApplicationBringsItsTipAndTakesItAwayAgain) {
    start();
    const std::vector<std::string> before = titles();

    device_.must({"install", makeSleepPackage(device_.folder() / "sleep")});
    std::vector<std::string> with = before;
    with.push_back("Sleep tight");
    EXPECT_EQ(titles(), with);

    device_.must({"uninstall", "com.ravella.sleep"});
    EXPECT_EQ(titles(), before);
}

TEST_F(TipsList, AnUpdateOfAnApplicationChangesNothing) {
    device_.must({"install", makeSleepPackage(device_.folder() / "sleep")});
    start();
    const std::vector<std::string> before = titles();

    const std::filesystem::path update = makeSleepPackage(device_.folder() / "update");
    std::filesystem::remove(update / "shared/res/contents/sleep_night.xml");
    EXPECT_EQ(device_.must({"install", update}), "updated com.ravella.sleep 1.0\n");

    EXPECT_EQ(titles(), before);
}

TEST_F(TipsList, AThemeChangesItsColours) {
    start();
    device_.must({"screenshot", "light.png"});

    device_.must({"set", "theme", "dark"});

    device_.must({"screenshot", "dark.png"});
    EXPECT_NE(support::readFile(device_.folder() / "light.png"), support::readFile(device_.folder() / "dark.png"));
    EXPECT_THAT(titles(), SizeIs(menusOfferedIn("Global").size()));
}

TEST_F(TipsList, FitsTheSmallScreen) {
    device_.must({"start", "--headless", "--screen", "480x800"});

    const nlohmann::json shown = list();
    EXPECT_EQ(shown["width"], 480);
    EXPECT_THAT(shown["rows"], SizeIs(menusOfferedIn("Global").size() + 1));
}

TEST_F(TipsList, FollowsAFinger) {
    start();
    const std::string first = titles().front();
    EXPECT_TRUE(holds("text=" + first));
    device_.must({"swipe", "360", "1100", "360", "200"});
    EXPECT_FALSE(holds("text=" + first));
}

TEST_F(TipsList, ALaterStartOpensTheMainMenuAndNoOtherFileOfTheCatalogue) {
    const auto openedAtAStart = [&](const char* name) {
        const std::filesystem::path trace = device_.folder() / name;
        const test_tool::Result started = device_.runTraced({"start", "--headless"}, trace);
        device_.must({"stop"});
        std::set<std::string> opened;
        std::istringstream lines(support::readFile(trace));
        const std::string folder = "/shared/res/contents/";
        for (std::string line; std::getline(lines, line);)
            if (const std::size_t at = line.find(folder); at != std::string::npos && line.find(".xml\"") != line.npos)
                opened.insert(line.substr(at + folder.size(), line.find('"', at) - at - folder.size()));
        return std::pair(started.status, opened);
    };
    const auto [first, openedFirst] = openedAtAStart("first");
    if (first != 0)
        GTEST_SKIP() << "processes may not be traced here: " << support::readFile(device_.folder() / "first");
    EXPECT_THAT(openedFirst, Contains("kest_menu.xml"));
    // A detail file and its string file for every menu.
    EXPECT_THAT(openedFirst, SizeIs(1 + 2 * menusOfferedIn("Global").size()));

    const auto [later, openedLater] = openedAtAStart("later");
    EXPECT_EQ(later, 0);
    EXPECT_THAT(openedLater, testing::ElementsAre("kest_menu.xml"));
}

TEST_F(TipsList, ALaterStartUsesTheCacheUntilItIsCleared) {
    start();
    const std::vector<std::string> first = titles();
    EXPECT_THAT(logged("Language changed"), IsEmpty()) << "there was no language to compare with";
    const std::size_t readAtFirst = logged("BEGIN").size();
    restart();
    EXPECT_EQ(titles(), first);
    EXPECT_GT(readAtFirst, first.size() * 2);
    EXPECT_LT(logged("BEGIN").size(), readAtFirst + first.size()) << "no tip is read again";

    device_.must({"stop"});
    EXPECT_NE(device_.json({"preferences", app})[app], nlohmann::json::object());
    device_.must({"clear", app});
    EXPECT_EQ(device_.json({"preferences", app})[app], nlohmann::json::object());
    start();
    EXPECT_EQ(titles(), first);
}
