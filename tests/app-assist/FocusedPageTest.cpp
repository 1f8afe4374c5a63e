#include "TipPage.h"

#include <gmock/gmock.h>

using testing::IsEmpty;

namespace {

/// A pager opened at a page that was touched and so has the focus.
class FocusedPage : public PageSlideViewTest, public testing::WithParamInterface<int> {
protected:
    void openAndTouch() {
        naviframe_.push(new TellingView("list", story_), nullptr, nullptr);
        test_ui::runFor(0.5);
        pager_ = open(GetParam());
        movements_.listenTo(*pager_);
        test_ui::runFor(0.5);
        screen().tap({400, 700});
        test_ui::runFor(0.5);
        ASSERT_EQ(touched(), elm_object_focused_object_get(window()));
    }
    const Evas_Object* touched() const { return pages_[static_cast<size_t>(GetParam())]->getEvasObj(); }

    Pager* pager_ = nullptr;
    Movements movements_;
};

TEST_P(FocusedPage, GetsTheFocusWithoutAMovement) {
    openAndTouch();
    EXPECT_EQ(GetParam(), pager_->inView());
    EXPECT_THAT(movements_.heard(), IsEmpty());
}

TEST_P(FocusedPage, GivesItAwayWhenAnotherOneComesIntoView) {
    openAndTouch();
    pager_->showPage(3, false);
    test_ui::runFor(0.5);
    EXPECT_NE(touched(), elm_object_focused_object_get(window()));
    EXPECT_EQ(3, pager_->inView());
    EXPECT_THAT(movements_.heard(), IsEmpty());
}

TEST_P(FocusedPage, GoesWithTheNaviframeWithoutAMovement) {
    openAndTouch();
    naviframe_.destroy();
    test_ui::runFor(0.5);
    EXPECT_EQ(nullptr, naviframe_.getTopView());
    EXPECT_THAT(movements_.heard(), IsEmpty());
}

TEST_P(FocusedPage, GoesWithTheWindowWithoutAMovement) {
    openAndTouch();
    evas_object_del(window());
    test_ui::runFor(0.5);
    EXPECT_EQ(nullptr, naviframe_.getTopView());
    EXPECT_THAT(movements_.heard(), IsEmpty());
}

TEST_P(FocusedPage, GoesWithItsPagerWithoutAMovement) {
    openAndTouch();
    naviframe_.back();
    test_ui::runFor(0.5);
    EXPECT_STREQ("list", naviframe_.getTopView()->getClassName());
    EXPECT_THAT(movements_.heard(), IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(Pages, FocusedPage, testing::Values(0, 2, 4));

}  // namespace
