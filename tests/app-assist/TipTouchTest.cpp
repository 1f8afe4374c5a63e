#include "TipPage.h"

#include <gmock/gmock.h>

using test_ui::Point;
using testing::IsEmpty;

namespace {

/// A finger on the text of a tip, which is longer than its place and ends with a link. Its swipes end beside the text,
/// where the text does not see it lift.
class TipTouch : public TipPagerTest {
protected:
    TipTouch() {
        openTips(2);
        test_ui::runFor(1.0);
    }
    int scrolledTo() {
        int y = 0;
        elm_scroller_region_get(tip(2).info, nullptr, &y, nullptr, nullptr);
        return y;
    }
    void showTheEnd() {
        int height = 0;
        elm_scroller_child_size_get(tip(2).info, nullptr, &height);
        elm_scroller_region_show(tip(2).info, 0, height - 1, 1, 1);
        test_ui::runFor(0.5);
    }
    /// Scrolls the text by hand, as far as it goes.
    void swipeToTheEnd() {
        for (int before = -1; before != scrolledTo();) {
            before = scrolledTo();
            screen().swipe({360, 1200}, {360, 500}, 0.06);
            test_ui::runFor(3.0);
        }
    }
    void tapLink() {
        screen().tap(test_ui::link(tip(2).entry, "more").middle());
        test_ui::runFor(0.5);
    }
    /// Plain text in sight, while the end is shown.
    static constexpr Point plainText{300, 900};
};

TEST_F(TipTouch, OpensTheLinkAfterASwipeThatShowedIt) {
    swipeToTheEnd();
    EXPECT_GT(scrolledTo(), 500);
    tapLink();
    EXPECT_EQ(1, tip(2).clicks);
}

TEST_F(TipTouch, OpensTheLinkAfterASlowSwipe) {
    showTheEnd();
    screen().swipe({360, 900}, {360, 1100}, 1.5);
    test_ui::runFor(1.0);
    screen().swipe({360, 1100}, {360, 500}, 1.5);
    test_ui::runFor(1.0);
    tapLink();
    EXPECT_EQ(1, tip(2).clicks);
}

TEST_F(TipTouch, OpensTheLinkAfterSwipesToTheNextPageAndBack) {
    showTheEnd();
    screen().swipe({650, 800}, {60, 600});
    test_ui::runFor(1.0);
    screen().swipe({60, 800}, {650, 600});
    test_ui::runFor(1.0);
    tapLink();
    EXPECT_EQ(1, tip(2).clicks);
    EXPECT_EQ(0, tip(3).clicks);
}

TEST_F(TipTouch, OpensTheLinkAfterALongPressOnTheText) {
    showTheEnd();
    screen().tap(plainText, 2.0);
    test_ui::runFor(0.5);
    tapLink();
    EXPECT_EQ(1, tip(2).clicks);
}

TEST_F(TipTouch, LeavesTheTextWhereItWasScrolledTo) {
    showTheEnd();
    const int before = scrolledTo();
    EXPECT_GT(before, 500);
    screen().tap(plainText);
    test_ui::runFor(0.5);
    EXPECT_EQ(before, scrolledTo());
    tapLink();
    EXPECT_EQ(before, scrolledTo());
    EXPECT_EQ(1, tip(2).clicks);
    EXPECT_THAT(heard(), IsEmpty());
}

TEST_F(TipTouch, LeavesTheTextOfANextPageWhereItWasScrolledTo) {
    screen().tap(plainText);
    screen().swipe({100, 900}, {650, 900});
    test_ui::runFor(1.0);
    screen().swipe({650, 900}, {100, 900});
    test_ui::runFor(1.0);
    showTheEnd();
    const int before = scrolledTo();
    tapLink();
    EXPECT_EQ(before, scrolledTo());
    EXPECT_EQ(1, tip(2).clicks);
}

}  // namespace
