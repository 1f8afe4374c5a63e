#include "PagerTest.h"

#include "KestContentMgr.h"
#include "KestMainView.h"

#include <device/Keys.h>

using testing::AllOf;
using testing::Contains;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

/// What changes on the device while the pager is open, with no list beneath that would close it.
class PagerChange : public PagerTest {
protected:
    void openAtRest(int menu = 0) {
        open(menu);
        test_ui::runFor(1);
        newLog();
        calls::forget();
    }
    void setTheme(const std::string& theme) { device()->settings().set(device::keys::theme, theme); }
    /// Writes the catalogue anew and has it loaded, as whoever hears of a change does.
    void reload(const std::vector<std::string>& tips) const {
        writeTips(tips);
        KestContentMgr::getInstance()->loadContentsList(true);
    }
    static std::string titled(const std::string& title, const std::string& text = "Text") {
        return "<title>" + title + "</title>" + kest_files::contents(text);
    }
    void writeTranslatedTips() {
        const std::string tip =
            "<title id=\"IDS_MINE\">x</title>" + kest_files::contents(kest_files::textTag("IDS_BODY"));
        writeTips({tip, tip});
        for (const int index : {0, 1})
            writeStrings({{"en", "IDS_MINE", "Mine"},
                          {"ko", "IDS_MINE", "내 것"},
                          {"en", "IDS_BODY", "Read this"},
                          {"ko", "IDS_BODY", "읽으세요"}},
                         "contents/tip" + std::to_string(index) + "-string.xml");
    }
    std::string shownTitle(int index) { return test_ui::plainText(titleLabel(index)); }
    std::string shownText(int index) { return test_ui::plainText(entry(index)); }

    static kest_log::Line hit(const std::string& function) { return kest_log::hit(pager_log::pageFile, function); }
    static kest_log::Line error(const std::string& function, const std::string& message) {
        return kest_log::error(pager_log::pageFile, function, message);
    }
    static kest_log::Line display() { return kest_log::begin(pager_log::pageFile, "onViewDisplay"); }
};

TEST_F(PagerChange, OfTheThemeRebuildsTheTitleOfEveryPage) {
    writeTips({titled("A"), titled("B")});
    openAtRest();
    reload({titled("New A", "New"), titled("New B", "New")});
    setTheme("dark");
    settle();
    EXPECT_THAT(shownTitle(0), HasSubstr("New A"));
    EXPECT_THAT(shownTitle(1), HasSubstr("New B"));
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
    EXPECT_EQ(shownText(0), "읽으세요");
    EXPECT_EQ(shownText(1), "읽으세요");
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

/// A catalogue that has become shorter than the pager. What a page shows stays, and a line tells of it.
class Shrinking : public PagerChange {
protected:
    void openThreeAndKeepOne(int menu) {
        writeTips({titled("A", "Text A"), titled("B", "Text B"), titled("C", "<a href=app>Open</a>")});
        openAtRest(menu);
        reload({titled("New", "New text")});
        newLog();
    }
    static kest_log::Line noRecord(int index) {
        return kest_log::info(pager_log::pageFile, "__copyRecord", "no record for index:" + std::to_string(index));
    }
};

TEST_F(Shrinking, LeavesTheTextsAtAChangeOfTheTheme) {
    openThreeAndKeepOne(2);
    setTheme("dark");
    settle();
    EXPECT_THAT(shownTitle(0), HasSubstr("New"));
    EXPECT_THAT(shownTitle(1), HasSubstr("B"));
    EXPECT_THAT(shownTitle(2), HasSubstr("C"));
    EXPECT_THAT(newLogOf(pager_log::pageFile), AllOf(Contains(noRecord(1)), Contains(noRecord(2))));
}

TEST_F(Shrinking, LeavesTheTextsAtAChangeOfTheLanguage) {
    openThreeAndKeepOne(2);
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(1);
    EXPECT_EQ(shownText(0), "New text");
    EXPECT_EQ(shownText(1), "Text B");
    EXPECT_EQ(shownText(2), "Open");
    EXPECT_THAT(newLogOf(pager_log::pageFile), AllOf(Contains(noRecord(1)), Contains(noRecord(2))));
}

TEST_F(Shrinking, StillTurnsAndDisplaysThePages) {
    openThreeAndKeepOne(2);
    swipe(-1);
    test_ui::runFor(1);
    EXPECT_EQ(pageInView(), 1);
    EXPECT_EQ(title(), "Tips 2/1");
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(Shrinking, LeavesALinkWithoutAnApplication) {
    openThreeAndKeepOne(2);
    screen().tap(test_ui::link(entry(2), "app").middle());
    EXPECT_THAT(device()->launches().all(), IsEmpty());
    EXPECT_THAT(newLog(), Contains(noRecord(2)));
}

TEST_F(Shrinking, LeavesPagesThatAreNotFilledYetEmpty) {
    writeTips({titled("A"), titled("B"), titled("C")});
    open();
    reload({titled("New")});
    test_ui::runFor(1);
    EXPECT_EQ(info(1), nullptr);
    EXPECT_EQ(info(2), nullptr);
    EXPECT_THAT(newLog(), AllOf(Contains(noRecord(1)), Contains(noRecord(2)), Not(Contains(noRecord(0)))));
    swipe();
    test_ui::runFor(1);
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(Shrinking, LeavesAPageThatWasNotFilledEmptyAtAChangeOfTheLanguage) {
    // To write an empty text leaves a line.
    const std::vector<std::string> tips = {titled("A"), titled("B", "")};
    writeTips(tips);
    open();
    reload({titled("New")});
    test_ui::runFor(1);
    ASSERT_EQ(info(1), nullptr);
    reload(tips);
    newLog();
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(1);
    ASSERT_EQ(KestContentMgr::getInstance()->getContentsList().at(1).textContents, "");
    EXPECT_EQ(info(1), nullptr);
    EXPECT_THAT(newLogOf(pager_log::pageFile),
                ElementsAre(hit("__languageChangedCb"), hit("__languageChangedCb"), display()));
}

TEST_F(Shrinking, ToNothingLeavesThePageInView) {
    writeTips({titled("A", "Text A")});
    openAtRest();
    reload({});
    setTheme("dark");
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(1);
    EXPECT_EQ(shownText(0), "Text A");
    EXPECT_THAT(newErrors(), IsEmpty());
}
