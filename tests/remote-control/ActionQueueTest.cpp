#include "ActionQueue.h"

#include "Input.h"
#include "SampleTest.h"

using remote_control::ActionQueue;
using testing::ElementsAre;

namespace {

class Actions : public SampleTest {
protected:
    /// Asks for an action; what became of it comes into results_.
    void ask(std::function<std::vector<remote_control::Playback::Step>(Evas*)> steps) {
        queue_->add({std::move(steps), [this](const std::string& error) { results_.push_back(error); }});
    }
    void askForTap(int x, int y) {
        ask([=](Evas* canvas) { return remote_control::input::tap(canvas, x, y); });
    }
    /// The middle of a row.
    test_ui::Point row(int index) {
        const auto place = find(read(), "Elm_Genlist").rows[static_cast<std::size_t>(index) - 1].element.place;
        return {place.centreX(), place.centreY()};
    }

    std::unique_ptr<ActionQueue> queue_ =
        std::make_unique<ActionQueue>([this] { return evas_object_evas_get(window()); });
    std::vector<std::string> results_;
};

}  // namespace

TEST_F(Actions, ATapChoosesTheRowAndEndsWhenTheNextPageStands) {
    askForTap(row(2).x, row(2).y);
    EXPECT_THAT(results_, ElementsAre());

    ASSERT_TRUE(test_ui::runUntil([this] { return !results_.empty(); }));

    EXPECT_THAT(results_, ElementsAre(""));
    EXPECT_EQ(sample_->choices(), 1);
    EXPECT_TRUE(find(read(), "Elm_Entry").visible());
    EXPECT_FALSE(find(read(), "Elm_Genlist").visible()) << "the transition is over";
}

TEST_F(Actions, ASwipeScrollsTheListAndChoosesNothing) {
    ask([](Evas* canvas) { return remote_control::input::swipe(canvas, 360, 1000, 360, 300, 0.2); });
    ASSERT_TRUE(test_ui::runUntil([this] { return !results_.empty(); }));

    EXPECT_THAT(results_, ElementsAre(""));
    EXPECT_EQ(sample_->choices(), 0);
    EXPECT_FALSE(find(read(), "Elm_Genlist").rows.front().element.visible());
}

TEST_F(Actions, KeysMoveTheFocusAndChooseARow) {
    for (const char* key : {"Down", "Down", "Return"}) {
        ask([key](Evas* canvas) { return remote_control::input::key(canvas, key); });
    }
    ASSERT_TRUE(test_ui::runUntil([this] { return results_.size() == 3; }));

    EXPECT_THAT(results_, ElementsAre("", "", ""));
    EXPECT_EQ(sample_->choices(), 1);
}

TEST_F(Actions, OneFollowsTheOther) {
    askForTap(row(1).x, row(1).y);
    ask([this](Evas*) {
        EXPECT_EQ(sample_->choices(), 1) << "the tap before is over";
        return std::vector<remote_control::Playback::Step>();
    });
    ASSERT_TRUE(test_ui::runUntil([this] { return results_.size() == 2; }));

    EXPECT_THAT(results_, ElementsAre("", ""));
}

TEST_F(Actions, APlaceOutsideTheScreenIsRefusedAndTheNextActionIsCarriedOut) {
    askForTap(720, 10);
    askForTap(row(1).x, row(1).y);
    ASSERT_TRUE(test_ui::runUntil([this] { return results_.size() == 2; }));

    EXPECT_THAT(results_, ElementsAre("the place 720,10 is outside the screen, which is 720x1280", ""));
    EXPECT_EQ(sample_->choices(), 1);
}

TEST_F(Actions, ASwipeThatTakesNoTimeOrForEverIsRefused) {
    for (const double seconds : {0.0, 11.0, -1.0, std::numeric_limits<double>::quiet_NaN()}) {
        ask([=](Evas* canvas) { return remote_control::input::swipe(canvas, 1, 1, 2, 2, seconds); });
    }

    EXPECT_THAT(results_, testing::Each("a swipe takes from 0.01 to 10 seconds"));
    EXPECT_EQ(results_.size(), 4U);
}

TEST_F(Actions, AnUnknownKeyIsRefusedWithTheKnownOnes) {
    ask([](Evas* canvas) { return remote_control::input::key(canvas, "Hyper"); });

    EXPECT_THAT(results_,
                ElementsAre("unknown key \"Hyper\"; there are Up, Down, Left, Right, Return, KP_Enter, space, Tab, "
                            "Escape, Delete, Home, End, Prior, BackSpace, XF86Back, Next, back, letters and digits"));
}

TEST_F(Actions, WhatIsUnderWayAtTheEndIsAnsweredWithAnError) {
    askForTap(1, 1);
    askForTap(2, 2);

    queue_.reset();

    EXPECT_THAT(results_, testing::Each("the application closed its window before the request was carried out"));
    EXPECT_EQ(results_.size(), 2U);
}

TEST_F(Actions, WhatHasOnlyToSettleAtTheEndIsAnsweredWell) {
    askForTap(row(1).x, row(1).y);
    ASSERT_TRUE(test_ui::runUntil([this] { return sample_->choices() == 1; }));
    test_ui::runFor(0.02);

    queue_.reset();

    EXPECT_THAT(results_, ElementsAre(""));
}
