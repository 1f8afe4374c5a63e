#include "ChangesTest.h"

#include "KestMainView.h"

using testing::Contains;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

TEST_F(PagerChange, OfTheThemeRebuildsTheTitleOfEveryPage) {
    writeTips({titled("A"), titled("B")});
    openAtRest();
    reload({titled("New A", "New"), titled("New B", "New")});
    setTheme("dark");
    settle();
    EXPECT_EQ(test_ui::text(titleLabel(0)), titleMarkup(icon(), "New A"));
    EXPECT_EQ(test_ui::text(titleLabel(1)), titleMarkup(icon(), "New B"));
    EXPECT_EQ(shownText(0), "Text");
}

TEST_F(PagerChange, OfTheThemeLeavesALineAPage) {
    writeTips({titled("A"), titled("B")});
    openAtRest(1);
    setTheme("dark");
    settle();
    EXPECT_THAT(newLogOf(pager_log::pageFile),
                ElementsAre(hit("__themeChangedCb"), hit("__themeChangedCb"), display()));
}

TEST_F(PagerChange, OfTheThemeDisplaysThePageThatWasOpenedAndNotTheOneInView) {
    writeTips({titled("A"), titled("B")});
    openAtRest(0);
    swipe();
    test_ui::runFor(1);
    ASSERT_EQ(title(), "Tips 2/2");
    calls::forget();
    setTheme("dark");
    settle();
    EXPECT_EQ(title(), "Tips 1/2");
    EXPECT_THAT(calls::story(0), ElementsAre("0.0 info show"));
    EXPECT_THAT(calls::story(1), IsEmpty());
    EXPECT_EQ(pageInView(), 1);
}

TEST_F(PagerChange, OfTheThemeBeforeThePagesAreFilledIsHarmless) {
    writeTips({titled("A"), titled("B")});
    push();
    setTheme("dark");
    settle();
    EXPECT_THAT(shownTitle(0), HasSubstr("A"));
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(PagerChange, OfTheThemeReachesEveryPageUntilItGoes) {
    writeTips({titled("A"), titled("B")});
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    settle();
    openAtRest();
    closePager();
    settle();
    EXPECT_THAT(calls::steps({"theme"}), ElementsAre("theme -", "theme -"));
    EXPECT_THAT(newLogOf(pager_log::pageFile), ElementsAre(hit("onDestroy"), hit("onDestroy")));
    setTheme("dark");
    settle();
    EXPECT_THAT(newLogOf(pager_log::pageFile), IsEmpty());
}

TEST_F(PagerChange, OfTheThemeReachesThePagerThatIsLeft) {
    writeTips({titled("A"), titled("B")});
    openAtRest(0);
    Pager* lower = &pager();
    openAtRest(1);
    closePager();
    settle();
    ASSERT_EQ(naviframe().getTopView(), lower);
    calls::forget();
    setTheme("dark");
    settle();
    EXPECT_THAT(calls::story(0), ElementsAre("0.0 info show"));
    EXPECT_EQ(test_ui::itemText(lower->getNaviItem(), "elm.text.title"), "Tips 1/2");
}

TEST_F(PagerChange, OfTheThemeWithoutAPageIsAnErrorLine) {
    writeTips({titled("A")});
    openAtRest();
    calls::themeCallback()(nullptr);
    EXPECT_THAT(newLog(), ElementsAre(hit("__themeChangedCb"), error("__themeChangedCb", "data is null")));
}

TEST_F(PagerChange, OfTheLanguageWritesTheTextsAnewHalfASecondLater) {
    writeTranslatedTips();
    openAtRest();
    ASSERT_EQ(shownText(0), "Read this");
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(0.4);
    EXPECT_EQ(shownText(0), "Read this");
    test_ui::runFor(0.2);
    for (const int page : {0, 1}) {
        EXPECT_EQ(test_ui::text(entry(page)), textMarkup("읽으세요"));
        EXPECT_EQ(test_ui::text(titleLabel(page)), titleMarkup(icon(), "내 것"));
    }
}

TEST_F(PagerChange, OfTheLanguageToOneWithoutATextIsToldOf) {
    writeTips({titled("A")});
    openAtRest();
    reload({"<title>A</title><contents></contents>"});
    newLog();
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(1);
    EXPECT_EQ(test_ui::text(entry(0)), "");
    EXPECT_THAT(newLog(),
                Contains(kest_log::info(pager_log::pageFile, "__setText", "contentList[0].textContents is empty")));
}

TEST_F(PagerChange, OfTheLanguageWritesThePageNumberAnew) {
    writeTranslatedTips();
    openAtRest(1);
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(1);
    EXPECT_EQ(title(), "2개 중 2");
    setLanguage("en_US.UTF-8");
    test_ui::runFor(1);
    EXPECT_EQ(title(), "Tips 2/2");
    EXPECT_EQ(shownText(1), "Read this");
}

TEST_F(PagerChange, OfTheLanguageLeavesALineAPage) {
    writeTranslatedTips();
    openAtRest();
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(1);
    EXPECT_THAT(newLogOf(pager_log::pageFile),
                ElementsAre(hit("__languageChangedCb"), hit("__languageChangedCb"), display()));
}

TEST_F(PagerChange, OfTheLanguageDisplaysThePageThatWasOpenedAndNotTheOneInView) {
    writeTranslatedTips();
    openAtRest(0);
    swipe();
    test_ui::runFor(1);
    ASSERT_EQ(title(), "Tips 2/2");
    calls::forget();
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(1);
    EXPECT_EQ(title(), "2개 중 1");
    EXPECT_THAT(calls::story(0), Contains(HasSubstr("info show")));
    EXPECT_THAT(calls::story(1), Not(Contains(HasSubstr("info show"))));
    EXPECT_EQ(pageInView(), 1);
}

TEST_F(PagerChange, OfTheLanguageWritesBeforeThePagesAreFilledInTheNewOne) {
    writeTranslatedTips();
    push();
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(1);
    EXPECT_EQ(shownText(0), "읽으세요");
    EXPECT_EQ(shownText(1), "읽으세요");
    EXPECT_EQ(title(), "2개 중 1");
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(PagerChange, OfTheLanguageComesToNothingWhenThePagerGoesMeanwhile) {
    writeTranslatedTips();
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    settle();
    openAtRest();
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(0.1);
    closePager();
    test_ui::runFor(0.3);
    ASSERT_EQ(topView(), "OtherView");
    newLog();
    test_ui::runFor(2);
    EXPECT_THAT(newLog(), IsEmpty());
}

TEST_F(PagerChange, OfTheLanguageComesToNothingWhenTheApplicationEndsMeanwhile) {
    writeTranslatedTips();
    openAtRest();
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(0.1);
    running_.reset();
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(PagerChange, OfTheLanguageOverAListClosesThePager) {
    writeTranslatedTips();
    startEmpty();
    naviframe().push(new KestMainView(true), nullptr, nullptr);
    settle();
    openAtRest();
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(2);
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(PagerChange, OfTheLanguageWithoutAPageIsAnErrorLine) {
    writeTips({titled("A")});
    push();
    const Evas_Smart_Cb changed = calls::smartCallback("language,changed");
    settle();
    newLog();
    changed(nullptr, nullptr, nullptr);
    settle();
    EXPECT_THAT(newLog(), ElementsAre(hit("__languageChangedCb"), error("__languageChangedCb", "data is null")));
}
