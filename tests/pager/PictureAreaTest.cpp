// Telling a group of objects from a single one takes a call that EFL still marks as beta.
#define EFL_BETA_API_SUPPORT

#include "PictureTest.h"

#include <Eo.h>

using testing::ElementsAre;
using testing::IsEmpty;

class PictureArea : public PictureTest {
protected:
    /// How many images of a page have that file, in sight or not.
    int imagesOf(const std::string& file) {
        int count = 0;
        for (Evas_Object* object = evas_object_bottom_get(screen().canvas()); object;
             object = evas_object_above_get(object))
            count += imagesOf(file, object);
        return count;
    }
    static void expectExpands(const Evas_Object* object) {
        double across = 0, down = 0;
        evas_object_size_hint_weight_get(object, &across, &down);
        EXPECT_EQ(std::pair(across, down), std::pair(EVAS_HINT_EXPAND, EVAS_HINT_EXPAND));
    }
    static void expectFills(const Evas_Object* object) {
        double across = 0, down = 0;
        evas_object_size_hint_align_get(object, &across, &down);
        EXPECT_EQ(std::pair(across, down), std::pair(EVAS_HINT_FILL, EVAS_HINT_FILL));
        expectExpands(object);
    }

private:
    static int imagesOf(const std::string& file, Evas_Object* object) {
        if (elm_object_widget_check(object) && typeOf(object) == "Elm_Image")
            return fileOf(object) == file ? 1 : 0;
        if (!efl_isa(object, EFL_CANVAS_GROUP_CLASS))
            return 0;
        int count = 0;
        Eina_List* members = evas_object_smart_members_get(object);
        void* member = nullptr;
        EINA_LIST_FREE(members, member)
        count += imagesOf(file, static_cast<Evas_Object*>(member));
        return count;
    }
};

TEST_F(PictureArea, OfOnePictureIsItsPage) {
    const std::string picture = drawPicture("a_01.png");
    openPage();
    EXPECT_EQ(groupOf(video()), "layout/multi_image/page");
    EXPECT_EQ(fileIn(video(), "page"), picture);
    EXPECT_EQ(elm_object_part_content_get(video(), "page.touch"), nullptr);
    EXPECT_EQ(sizeOf(video()), (Size{716, 655}));
    EXPECT_TRUE(evas_object_visible_get(video()));
}

TEST_F(PictureArea, ShowsThePicture) {
    drawPicture("a_01.png", 716, 655, 0xAA3300);
    openPage();
    settle();
    const test_ui::Point middle = test_ui::geometry(video()).middle();
    // A thread reads the file in its own time.
    EXPECT_TRUE(test_ui::runUntil([&] { return screen().picture().pixel(middle.x, middle.y) == 0xAA3300U; }, 600));
}

TEST_F(PictureArea, HasAPictureOnce) {
    const std::string picture = drawPicture("a_01.png");
    openPage();
    EXPECT_EQ(imagesOf(picture), 1);
}

TEST_F(PictureArea, HasATallPictureOnce) {
    const std::string picture = drawPicture("a_01.png", 716, 900);
    openPage();
    EXPECT_EQ(imagesOf(picture), 1);
}

TEST_F(PictureArea, IsFilledByItsPicture) {
    drawSequence(2, {0});
    openPage();
    expectExpands(video());
    for (Evas_Object* picture : pictures()) {
        expectExpands(picture);
        expectFills(elm_object_part_content_get(picture, "page"));
        expectExpands(elm_object_part_content_get(picture, "sizer"));
    }
    expectFills(elm_object_part_content_get(pictures()[0], "page.touch"));
}

TEST_F(PictureArea, IsFilledByATallPicture) {
    drawPicture("a_01.png", 716, 900);
    openPage();
    Evas_Object* tall = elm_object_content_get(pictureScroller());
    expectExpands(video());
    expectExpands(tall);
    expectFills(elm_object_part_content_get(tall, "page"));
    expectExpands(elm_object_part_content_get(tall, "sizer"));
}

TEST_F(PictureArea, IsFilledByThePlaceholder) {
    openPage("missing.png");
    expectFills(video());
}

TEST_F(PictureArea, OfOnePictureIsToldOfInTheLog) {
    const std::string picture = drawPicture("a_01.png", 716, 655);
    openPage();
    EXPECT_THAT(buildLog(),
                ElementsAre(info("build", "secondImagePath is " + picturePath("a_02.png")),
                            info("__createImage", "imagePath : " + picture),
                            info("__buildSingle", "weight:716, height:655"), hit("__createPage"),
                            info("__createPage", "imagePath_touch = " + picturePath("a_01_touch.png")),
                            info("__createPage", "imagePath_russia = " + picturePath("a_russia_01.png")),
                            info("isRussian", "locale = en_US"), info("__createImage", "imagePath : " + picture)));
}

TEST_F(PictureArea, OfAPicture655HighIsItsPage) {
    drawPicture("a_01.png", 716, 655);
    openPage();
    EXPECT_EQ(groupOf(video()), "layout/multi_image/page");
    EXPECT_THAT(newLog(),
                testing::Contains(kest_log::info("KestContentSubView.cpp", "__fillLayout", "imageHeight: 0")));
}

TEST_F(PictureArea, OfAPicture656HighScrolls) {
    const std::string picture = drawPicture("a_01.png", 716, 656);
    openPage();
    EXPECT_EQ(groupOf(video()), "layout/multi_image");
    Evas_Object* tall = elm_object_content_get(pictureScroller());
    EXPECT_EQ(groupOf(tall), "layout/multi_image/page");
    EXPECT_EQ(fileIn(tall, "page"), picture);
    EXPECT_EQ(sizeOf(tall), (Size{716, 656}));
    EXPECT_THAT(newLog(),
                testing::Contains(kest_log::info("KestContentSubView.cpp", "__fillLayout", "imageHeight: 1")));
}

TEST_F(PictureArea, OfATallPictureIsToldOfInTheLog) {
    const std::string picture = drawPicture("a_01.png", 716, 900);
    openPage();
    EXPECT_THAT(buildLog(), ElementsAre(info("build", "secondImagePath is " + picturePath("a_02.png")),
                                        info("__createImage", "imagePath : " + picture),
                                        info("__buildSingle", "weight:716, height:900"), hit("__createVerticalPage"),
                                        info("__createImage", "imagePath : " + picture)));
}

TEST_F(PictureArea, OfATallPictureIsAsHighAsThatAtThePagesWidth) {
    drawPicture("a_01.png", 359, 701);
    openPage();
    EXPECT_EQ(sizeOf(elm_object_content_get(pictureScroller())), (Size{716, 1398}));
}

TEST_F(PictureArea, OfATallPictureIsScrolledByNoFinger) {
    drawPicture("a_01.png", 716, 900);
    openPage();
    Evas_Object* scroller = pictureScroller();
    EXPECT_EQ(elm_scroller_movement_block_get(scroller), ELM_SCROLLER_MOVEMENT_BLOCK_VERTICAL);
    EXPECT_STREQ(elm_object_style_get(scroller), "effect");
    Eina_Bool horizontal = EINA_TRUE, vertical = EINA_FALSE;
    elm_scroller_bounce_get(scroller, &horizontal, &vertical);
    EXPECT_FALSE(horizontal);
    EXPECT_TRUE(vertical);
    Elm_Scroller_Policy horizontalBar{}, verticalBar{};
    elm_scroller_policy_get(scroller, &horizontalBar, &verticalBar);
    EXPECT_EQ(horizontalBar, ELM_SCROLLER_POLICY_OFF);
    EXPECT_EQ(verticalBar, ELM_SCROLLER_POLICY_OFF);
}

TEST_F(PictureArea, OfASequenceHasItsPicturesSideBySide) {
    drawSequence(3, {1});
    openPage();
    EXPECT_EQ(groupOf(video()), "layout/multi_image");
    EXPECT_THAT(filesIn(pictures()),
                ElementsAre(picturePath("a_01.png"), picturePath("a_02.png"), picturePath("a_03.png")));
    EXPECT_THAT(filesIn(pictures(), "page.touch"), ElementsAre("", picturePath("a_02_touch.png"), ""));
    for (Evas_Object* picture : pictures()) {
        EXPECT_EQ(groupOf(picture), "layout/multi_image/page");
        EXPECT_EQ(sizeOf(picture), (Size{716, 655}));
    }
}

TEST_F(PictureArea, OfASequenceIsToldOfInTheLog) {
    drawSequence(3);
    openPage();
    std::vector<kest_log::Line> lines = {info("build", "secondImagePath is " + picturePath("a_02.png"))};
    for (const std::string number : {"01", "02", "03"}) {
        lines.push_back(hit("__createPage"));
        lines.push_back(info("__createPage", "imagePath_touch = " + picturePath("a_" + number + "_touch.png")));
        lines.push_back(info("__createPage", "imagePath_russia = " + picturePath("a_russia_" + number + ".png")));
        lines.push_back(info("isRussian", "locale = en_US"));
        lines.push_back(info("__createImage", "imagePath : " + picturePath("a_" + number + ".png")));
    }
    lines.push_back(info("__buildSequence", "NextImagePath is " + picturePath("a_03.png")));
    EXPECT_EQ(buildLog(), lines);
}

TEST_F(PictureArea, OfASequenceIsPagedByNoFinger) {
    drawSequence(2);
    openPage();
    Evas_Object* scroller = pictureScroller();
    EXPECT_EQ(elm_scroller_movement_block_get(scroller), ELM_SCROLLER_MOVEMENT_BLOCK_HORIZONTAL);
    EXPECT_EQ(elm_scroller_single_direction_get(scroller), ELM_SCROLLER_SINGLE_DIRECTION_HARD);
    EXPECT_TRUE(elm_object_scroll_lock_y_get(scroller));
    Eina_Bool horizontalLoop = EINA_TRUE, verticalLoop = EINA_TRUE;
    elm_scroller_loop_get(scroller, &horizontalLoop, &verticalLoop);
    EXPECT_FALSE(horizontalLoop || verticalLoop);
    Elm_Scroller_Policy horizontalBar{}, verticalBar{};
    elm_scroller_policy_get(scroller, &horizontalBar, &verticalBar);
    EXPECT_EQ(horizontalBar, ELM_SCROLLER_POLICY_OFF);
    EXPECT_EQ(verticalBar, ELM_SCROLLER_POLICY_OFF);
    Eina_Bool horizontalBounce = EINA_TRUE, verticalBounce = EINA_TRUE;
    elm_scroller_bounce_get(scroller, &horizontalBounce, &verticalBounce);
    EXPECT_FALSE(horizontalBounce || verticalBounce);
    int horizontalLimit = 0, verticalLimit = 1;
    elm_scroller_page_scroll_limit_get(scroller, &horizontalLimit, &verticalLimit);
    EXPECT_EQ(horizontalLimit, 1);
    const int noLimit = 9999;  // what a scroller makes of 0
    EXPECT_EQ(verticalLimit, noLimit);
}

TEST_F(PictureArea, OfASequenceStaysWhereItIsBelowAFingerThatMovesUpOrDown) {
    drawSequence(2);
    openPage();
    test_ui::runFor(0.5);
    const test_ui::Point middle = test_ui::geometry(video()).middle();
    const test_ui::Rect before = test_ui::geometry(pictures()[0]);
    for (const int way : {200, -200}) {
        calls::forget();
        screen().press(middle);
        for (int step = 1; step <= 10; ++step) {
            screen().moveTo({middle.x, middle.y + way * step / 10});
            test_ui::runFor(0.02);
            EXPECT_EQ(test_ui::geometry(pictures()[0]), before);
        }
        screen().lift();
        test_ui::runFor(0.2);
        EXPECT_EQ(test_ui::geometry(pictures()[0]), before);
        EXPECT_THAT(calls::story(), IsEmpty());
    }
}

TEST_F(PictureArea, EndsASequenceBeforeTheFirstMissingPicture) {
    drawSequence(2);
    drawPicture("a_04.png");
    openPage();
    EXPECT_THAT(filesIn(pictures()), ElementsAre(picturePath("a_01.png"), picturePath("a_02.png")));
}

TEST_F(PictureArea, CountsASequenceOnAfterNine) {
    drawSequence(11);
    openPage();
    EXPECT_EQ(filesIn(pictures()).back(), picturePath("a_11.png"));
    EXPECT_EQ(pictures().size(), 11U);
}

TEST_F(PictureArea, OfASequenceFollowsTheSecondPictureWhateverNumberTheFirstHas) {
    drawPicture("a_05.png");
    drawPicture("a_02.png");
    drawPicture("a_03.png");
    openPage("a_05.png");
    EXPECT_THAT(filesIn(pictures()),
                ElementsAre(picturePath("a_05.png"), picturePath("a_02.png"), picturePath("a_03.png")));
}

TEST_F(PictureArea, OfAPictureThatEndsInTwoShowsThatTwice) {
    drawPicture("a_02.png");
    openPage("a_02.png");
    EXPECT_THAT(filesIn(pictures()), ElementsAre(picturePath("a_02.png"), picturePath("a_02.png")));
}

TEST_F(PictureArea, IsFilledOnce) {
    drawSequence(2);
    openPage();
    Evas_Object* area = video();
    newLog();
    test_ui::runFor(0.5);
    EXPECT_EQ(video(), area);
    EXPECT_THAT(buildLog(), IsEmpty());
}
