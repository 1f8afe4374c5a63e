#include "ChangesTest.h"

using testing::AllOf;
using testing::Contains;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

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
