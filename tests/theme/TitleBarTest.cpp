#include "ScreenTest.h"

namespace {

using test_ui::Rect;

constexpr unsigned int page = 0xF7F8FA;

class TitleBar : public ScreenTest {
protected:
    static void count(void* number, Evas_Object*, void*) { ++*static_cast<int*>(number); }

    /// The leftmost column of the bar in which something is drawn.
    int firstInk() {
        const auto picture = screen().picture();
        int x = 0;
        while (x < 719 && picture.colours({x, 20, 1, 72}) == 1)
            ++x;
        return x;
    }
};

TEST_F(TitleBar, BeginsAtTheMarginAndAfterTheBackButton) {
    start();
    pushList(threeRows());
    EXPECT_NEAR(36, firstInk(), 4);
    pushPage();
    test_ui::runFor(0.5);
    EXPECT_NEAR(38, firstInk(), 3);
    const auto picture = screen().picture();
    EXPECT_GT(picture.colours({24, 32, 48, 48}), 1);
    EXPECT_EQ(1, picture.colours({74, 20, 28, 72}));
    EXPECT_GT(picture.colours({104, 20, 60, 72}), 1);
}

TEST_F(TitleBar, CutsALongTitleBeforeTheMargin) {
    start();
    pushList(threeRows());
    elm_object_item_part_text_set(pushPage(), "elm.text.title",
                                  "A title that is far too long for any bar of any device");
    test_ui::runFor(0.5);
    EXPECT_GT(screen().picture().colours({600, 20, 84, 72}), 1);
    EXPECT_EQ(1, screen().picture().colours({684, 20, 36, 72}));
}

TEST_F(TitleBar, MakesRoomForThePageWhereItIsSwitchedOff) {
    start();
    Evas_Object* list = pushList(threeRows());
    Elm_Object_Item* item = elm_naviframe_top_item_get(naviframe_);
    int finished = 0;
    evas_object_smart_callback_add(naviframe_, "title,transition,finished", count, &finished);
    elm_naviframe_item_title_enabled_set(item, EINA_FALSE, EINA_TRUE);
    test_ui::runFor(0.5);
    EXPECT_EQ((Rect{0, 0, 720, 1280}), test_ui::geometry(list));
    EXPECT_EQ(1, finished);
    elm_naviframe_item_title_enabled_set(item, EINA_TRUE, EINA_FALSE);
    test_ui::runFor(0.1);
    EXPECT_EQ((Rect{0, 112, 720, 1168}), test_ui::geometry(list));
}

class BackButton : public ScreenTest {};

TEST_F(BackButton, WorksWhereverItsAreaIsTouched) {
    start();
    pushList(threeRows());
    pushPage();
    test_ui::runFor(0.5);
    for (const test_ui::Point at : {test_ui::Point{3, 3}, {48, 56}, {92, 108}}) {
        clicks_ = 0;
        screen().tap(at);
        test_ui::runFor(0.3);
        EXPECT_EQ(1, clicks_) << at.x << "," << at.y;
    }
    screen().tap({110, 56});
    test_ui::runFor(0.3);
    EXPECT_EQ(1, clicks_);
}

TEST_F(BackButton, ShowsTheFingerThatIsOnIt) {
    start();
    pushList(threeRows());
    pushPage();
    test_ui::runFor(0.5);
    const auto ground = [&] { return screen().picture().pixel(20, 56); };
    EXPECT_EQ(page, ground());
    screen().press({48, 56});
    test_ui::runFor(0.05);
    EXPECT_THAT(ground(), LooksLike(0xDCEBEFu));
    screen().lift();
    test_ui::runFor(0.4);
    EXPECT_EQ(page, ground());
}

TEST_F(BackButton, PointsTheOtherWayWhereOneReadsFromRightToLeft) {
    start();
    pushList(threeRows());
    pushPage();
    test_ui::runFor(0.5);
    const auto before = screen().picture();
    EXPECT_NE(page, before.pixel(41, 56));
    EXPECT_EQ(page, before.pixel(52, 56));
    elm_config_mirrored_set(EINA_TRUE);
    test_ui::runFor(0.5);
    const auto after = screen().picture();
    EXPECT_NE(page, after.pixel(719 - 41, 56));
    EXPECT_EQ(page, after.pixel(719 - 52, 56));
}

class Pages : public ScreenTest {
protected:
    static void count(void* number, Evas_Object*, void*) { ++*static_cast<int*>(number); }
};

TEST_F(Pages, SlideInAndOutWithinThreeTenthsOfASecondAndTakeInputAfterwards) {
    start();
    Evas_Object* list = pushList(threeRows());
    int finished = 0;
    evas_object_smart_callback_add(naviframe_, "transition,finished", count, &finished);
    for (int round = 1; round <= 3; ++round) {
        pushPage();
        test_ui::runFor(0.1);
        EXPECT_LT(test_ui::geometry(list).x, 0);
        EXPECT_TRUE(test_ui::runUntil([&] { return finished == 2 * round - 1; }, 0.25));
        clicks_ = 0;
        screen().tap({48, 56});
        test_ui::runFor(0.05);
        EXPECT_EQ(1, clicks_);
        elm_naviframe_item_pop(naviframe_);
        EXPECT_TRUE(test_ui::runUntil([&] { return finished == 2 * round; }, 0.35));
        EXPECT_EQ((Rect{0, 112, 720, 1168}), test_ui::geometry(list));
    }
    EXPECT_EQ(1u, eina_list_count(elm_naviframe_items_get(naviframe_)));
}

TEST_F(Pages, InsertedBeneathOrAboveStandStillAndTheRightOneShows) {
    start();
    pushPage();
    test_ui::runFor(0.5);
    Elm_Object_Item* top = elm_naviframe_top_item_get(naviframe_);
    const auto before = screen().picture();
    Evas_Object* beneath = elm_layout_add(naviframe_);
    elm_object_item_part_text_set(
        elm_naviframe_item_insert_before(naviframe_, top, nullptr, nullptr, nullptr, beneath, nullptr),
        "elm.text.title", "Beneath");
    test_ui::runFor(0.5);
    EXPECT_EQ(before, screen().picture());
    elm_naviframe_item_pop(naviframe_);
    test_ui::runFor(0.5);
    EXPECT_NE(before, screen().picture());
    EXPECT_GT(screen().picture().colours({36, 20, 200, 72}), 1);
}

}  // namespace
