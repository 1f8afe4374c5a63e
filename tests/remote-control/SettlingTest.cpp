#include "Settling.h"

#include "SampleTest.h"
#include "ScrollWatch.h"
#include "ui/Clock.h"

using remote_control::ScrollWatch;
using remote_control::Settling;

namespace {

class ScreenSettling : public SampleTest {
protected:
    /// How long it takes until the screen counts as settled.
    double settledAfter() {
        const double begin = ecore_loop_time_get();
        bool settled = false;
        const ScrollWatch scrolls(evas_object_evas_get(window()));
        const Settling settling(evas_object_evas_get(window()), scrolls, [&] { settled = true; });
        EXPECT_TRUE(test_ui::runUntil([&] { return settled; }, 10));
        return ecore_loop_time_get() - begin;
    }

    /// Something that is drawn anew with every frame.
    Ecore_Animator* animate() {
        Evas_Object* moving = evas_object_rectangle_add(evas_object_evas_get(window()));
        evas_object_resize(moving, 10, 10);
        evas_object_show(moving);
        return ecore_animator_add(
            [](void* data) -> Eina_Bool {
                int x = 0;
                auto* object = static_cast<Evas_Object*>(data);
                evas_object_geometry_get(object, &x, nullptr, nullptr, nullptr);
                evas_object_move(object, (x + 1) % 100, 0);
                return ECORE_CALLBACK_RENEW;
            },
            moving);
    }
};

}  // namespace

TEST_F(ScreenSettling, AScreenAtRestHasSettledAfterAMoment) {
    EXPECT_NEAR(settledAfter(), 0.15, 0.05);
}

TEST_F(ScreenSettling, ATransitionIsWaitedFor) {
    elm_genlist_item_selected_set(elm_genlist_first_item_get(sample_->list()), EINA_TRUE);

    EXPECT_GT(settledAfter(), 0.3);
    EXPECT_FALSE(find(read(), "Elm_Genlist").visible());
}

TEST_F(ScreenSettling, ATransitionThatGetsNoTimeToMoveIsWaitedFor) {
    elm_genlist_item_selected_set(elm_genlist_first_item_get(sample_->list()), EINA_TRUE);
    bool settled = false;
    const ScrollWatch scrolls(evas_object_evas_get(window()));
    const Settling settling(evas_object_evas_get(window()), scrolls, [&] { settled = true; });
    ecore_timer_add(
        0.1,
        [](void*) -> Eina_Bool {
            test_ui::clock::stop();
            return ECORE_CALLBACK_CANCEL;
        },
        nullptr);

    test_ui::runFor(1);
    EXPECT_FALSE(settled);

    EXPECT_TRUE(test_ui::runUntil([&] { return settled; }));
    EXPECT_FALSE(find(read(), "Elm_Genlist").visible());
}

TEST_F(ScreenSettling, AScreenThatNeverRestsIsWaitedForThreeSeconds) {
    Ecore_Animator* animator = animate();

    EXPECT_NEAR(settledAfter(), 3, 0.1);

    ecore_animator_del(animator);
}

TEST_F(ScreenSettling, ChangesMadeMeanwhileBeginItAnew) {
    ecore_timer_add(
        0.1,
        [](void* data) -> Eina_Bool {
            static_cast<sample::SampleWindow*>(data)->setTitle("Vegetables");
            return ECORE_CALLBACK_CANCEL;
        },
        &*sample_);

    EXPECT_NEAR(settledAfter(), 0.25, 0.06);
}

TEST_F(ScreenSettling, SaysNothingOnceItIsDestroyed) {
    bool settled = false;
    {
        const ScrollWatch scrolls(evas_object_evas_get(window()));
        const Settling settling(evas_object_evas_get(window()), scrolls, [&] { settled = true; });
    }
    test_ui::runFor(4);

    EXPECT_FALSE(settled);
}

TEST_F(ScreenSettling, AScrollingListIsWaitedForToItsEnd) {
    const ScrollWatch scrolls(evas_object_evas_get(window()));
    screen().swipe({360, 1000}, {360, 300}, 0.2);
    ASSERT_TRUE(scrolls.isScrolling());
    bool settled = false;
    const Settling settling(evas_object_evas_get(window()), scrolls, [&] { settled = true; });

    ASSERT_TRUE(test_ui::runUntil([&] { return settled; }));

    EXPECT_FALSE(scrolls.isScrolling());
    screen().tap({360, 600});
    EXPECT_EQ(sample_->choices(), 1) << "the tap counts";
}

TEST_F(ScreenSettling, AListThatGoesWhileItScrollsIsForgotten) {
    const ScrollWatch scrolls(evas_object_evas_get(window()));
    screen().swipe({360, 1000}, {360, 300}, 0.2);
    ASSERT_TRUE(scrolls.isScrolling());

    evas_object_del(sample_->stack());

    EXPECT_FALSE(scrolls.isScrolling());
}
