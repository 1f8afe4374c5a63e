#include "Condition.h"

#include "SampleTest.h"

using remote_control::Condition;

namespace {

class ScreenCondition : public SampleTest {
protected:
    bool holds(const std::string& words) { return Condition(words).holdsOn(read()); }
};

}  // namespace

TEST_F(ScreenCondition, TextHoldsForATextInSight) {
    EXPECT_TRUE(holds("text=Apple"));
    EXPECT_FALSE(holds("text=Pear"));
}

TEST_F(ScreenCondition, NoTextHoldsWhenNoneIsInSight) {
    EXPECT_TRUE(holds("no-text=Pear"));
    EXPECT_FALSE(holds("no-text=Apple"));
}

TEST_F(ScreenCondition, ViewHoldsForTheViewOnTop) {
    EXPECT_TRUE(holds("view=FruitView"));
    EXPECT_FALSE(holds("view=PageView"));

    elm_genlist_item_selected_set(elm_genlist_first_item_get(sample_->list()), EINA_TRUE);
    test_ui::runFor(1);

    EXPECT_TRUE(holds("view=PageView"));
    EXPECT_FALSE(holds("view=FruitView"));
}

TEST_F(ScreenCondition, RowsCountsTheRowsOfAListInSight) {
    EXPECT_TRUE(holds("rows=40"));
    EXPECT_FALSE(holds("rows=39"));
}

TEST_F(ScreenCondition, RefusesAnUnknownKind) {
    EXPECT_EQ(errorOf([] { Condition("colour=red"); }),
              "unknown condition \"colour=red\"; there are text=TEXT, no-text=TEXT, view=NAME and rows=NUMBER");
    EXPECT_EQ(errorOf([] { Condition("text"); }),
              "unknown condition \"text\"; there are text=TEXT, no-text=TEXT, view=NAME and rows=NUMBER");
}

TEST_F(ScreenCondition, RefusesAnEmptyValue) {
    EXPECT_EQ(errorOf([] { Condition("text="); }), "the condition \"text=\" says nothing after its \"=\"");
}

TEST_F(ScreenCondition, RefusesANumberThatIsNone) {
    EXPECT_EQ(errorOf([] { Condition("rows=4x"); }), "the condition \"rows=4x\" needs a number after its \"=\"");
    EXPECT_EQ(errorOf([] { Condition("rows=-1"); }), "the condition \"rows=-1\" needs a number after its \"=\"");
}
