#include "PageTest.h"

namespace {

using test_ui::Rect;

constexpr unsigned int red = 0xC03020;
constexpr unsigned int blue = 0x3020C0;
constexpr unsigned int ground = 0xDCE8EC;
constexpr unsigned int lightPage = 0xF7F8FA;
constexpr unsigned int darkPage = 0x0E1116;

class PictureArea : public PageTest {
protected:
    Rect area() const { return test_ui::geometry(elm_object_part_content_get(layout_, "video")); }
    unsigned int pixel(int x, int y) { return screen().picture().pixel(x, y); }

    /// A picture like a marker's: nothing but a filled square in the middle.
    std::string marker() {
        std::vector<unsigned int> pixels(716 * 655, 0);
        for (int y = 300; y < 355; ++y)
            std::fill_n(pixels.begin() + y * 716 + 330, 56, 0xFF000000 | blue);
        Ecore_Evas* frame = ecore_evas_buffer_new(1, 1);
        Evas_Object* image = evas_object_image_add(ecore_evas_get(frame));
        evas_object_image_size_set(image, 716, 655);
        evas_object_image_alpha_set(image, EINA_TRUE);
        evas_object_image_data_copy_set(image, pixels.data());
        const auto file = device_.folder() / "marker.png";
        EXPECT_TRUE(evas_object_image_save(image, file.c_str(), nullptr, nullptr));
        ecore_evas_free(frame);
        test_ui::clock::driveAnimations();
        return file;
    }
};

TEST_F(PictureArea, ShowsAPicturePixelByPixelBelowTheTitleBar) {
    startPage();
    std::vector<unsigned int> pixels(716 * 655);
    for (int i = 0; i < 716 * 655; ++i)
        pixels[static_cast<std::size_t>(i)] = 0xFF000000 | static_cast<unsigned int>(i);
    const auto file = device_.folder() / "pixels.png";
    ASSERT_TRUE(test_ui::Picture(716, 655, pixels.data()).save(file));
    showPicture(file);
    test_ui::runFor(1);
    EXPECT_EQ((Rect{2, 112, 716, 655}), area());
    const auto shown = screen().picture();
    for (const int y : {30, 327, 620}) {
        for (int x = 60; x < 650; ++x)
            ASSERT_EQ(static_cast<unsigned int>(y * 716 + x), shown.pixel(2 + x, 112 + y)) << x << "," << y;
    }
}

TEST_F(PictureArea, IsAsHighAsASmallPageOnTheSmallScreenAndKeepsThePicturesShape) {
    startPage({.isLarge = false});
    showPicture(picture(red));
    test_ui::runFor(1);
    EXPECT_EQ((Rect{1, 73, 478, 369}), area());
    const auto shown = screen().picture();
    EXPECT_EQ(red, shown.pixel(240, 73 + 184));
    EXPECT_EQ(red, shown.pixel(240 - 198, 73 + 184));
    EXPECT_EQ(red, shown.pixel(240 + 198, 73 + 184));
    EXPECT_EQ(ground, shown.pixel(240 - 208, 73 + 184));
    EXPECT_EQ(ground, shown.pixel(240 + 208, 73 + 184));
}

class Frame : public PictureArea, public testing::WithParamInterface<bool> {};

TEST_P(Frame, CutsTheCornersOfWhateverIsInIt) {
    startPage({.isDark = GetParam()});
    elm_object_part_content_set(layout_, "video", image(layout_, picture(red)));
    test_ui::runFor(1);
    const unsigned int page = GetParam() ? darkPage : lightPage;
    const unsigned int frame = GetParam() ? 0x3B4654 : 0x1C232C;
    const auto shown = screen().picture();
    for (const int x : {2, 717}) {
        for (const int y : {112, 766})
            EXPECT_EQ(page, shown.pixel(x, y)) << x << "," << y;
    }
    EXPECT_THAT(shown.pixel(6, 400), LooksLike(page));
    EXPECT_THAT(shown.pixel(18, 400), LooksLike(frame));
    EXPECT_THAT(shown.pixel(719 - 18, 400), LooksLike(frame));
    EXPECT_THAT(shown.pixel(360, 112 + 16), LooksLike(frame));
    EXPECT_THAT(shown.pixel(360, 766 - 16), LooksLike(frame));
    EXPECT_EQ(red, shown.pixel(2 + 24, 400)) << "nothing more than 24 pixels from the border is covered";
    EXPECT_EQ(red, shown.pixel(717 - 24, 400));
    EXPECT_EQ(red, shown.pixel(360, 112 + 24));
    EXPECT_EQ(red, shown.pixel(360, 766 - 24));
    EXPECT_EQ(red, shown.pixel(2 + 36, 112 + 36));
    EXPECT_EQ(0, shown.count(red, {0, 112, 28, 28})) << "the corner is round";
}

INSTANTIATE_TEST_SUITE_P(Theme, Frame, testing::Bool(), [](const auto& test) { return test.param ? "dark" : "light"; });

TEST_F(PictureArea, HasItsFrameBeforeThereIsAPicture) {
    startPage();
    test_ui::runFor(1);
    EXPECT_THAT(pixel(18, 400), LooksLike(0x1C232Cu));
    EXPECT_EQ(ground, pixel(360, 400));
}

TEST_F(PictureArea, IsInTheMiddleWhereOneReadsFromRightToLeft) {
    elm_config_mirrored_set(EINA_TRUE);
    startPage();
    showPicture(picture(red));
    test_ui::runFor(1);
    EXPECT_EQ((Rect{2, 112, 716, 655}), area());
}

TEST_F(PictureArea, GivesEachPageOfASequenceItsWholeWidth) {
    startPage();
    showSequence({picture(red), picture(blue), picture(red)});
    test_ui::runFor(1);
    for (int i = 0; i < 3; ++i)
        EXPECT_EQ((Rect{2 + 716 * i, 112, 716, 655}), test_ui::geometry(pages_[static_cast<std::size_t>(i)]));
    EXPECT_EQ(red, pixel(360, 400));
    elm_scroller_page_show(scroller_, 1, 0);
    test_ui::runFor(0.5);
    EXPECT_EQ(blue, pixel(360, 400));
    EXPECT_EQ(blue, pixel(2 + 24, 400));
    EXPECT_EQ(blue, pixel(717 - 24, 400));
}

TEST_F(PictureArea, GivesEachPageOfASequenceItsWholeWidthOnTheSmallScreenToo) {
    startPage({.isLarge = false});
    showSequence({picture(red), picture(blue)});
    test_ui::runFor(1);
    EXPECT_EQ((Rect{1, 73, 478, 369}), test_ui::geometry(pages_[0]));
    EXPECT_EQ((Rect{479, 73, 478, 369}), test_ui::geometry(pages_[1]));
}

TEST_F(PictureArea, MakesATallPictureAsHighAsItIs) {
    startPage();
    showTall(picture(red, 716, 1310), 1310);
    test_ui::runFor(1);
    EXPECT_EQ((Rect{2, 112, 716, 1310}), test_ui::geometry(elm_object_content_get(scroller_)));
}

TEST_F(PictureArea, DrawsNoSizer) {
    startPage();
    pages_.push_back(picturePage(layout_, picture(red), "", 716, 655));
    elm_object_part_content_set(layout_, "video", pages_[0]);
    elm_object_part_content_unset(pages_[0], "page");
    test_ui::runFor(1);
    EXPECT_EQ(ground, pixel(360, 400));
}

class TouchMarker : public PictureArea {
protected:
    void show() {
        const std::string file = marker();
        startPage();
        showSequence({picture(red), picture(red)}, {file});
        test_ui::runFor(1);
    }
    /// How much of the marker is seen: 0 for nothing, 1 for all of it.
    double seen() {
        const auto part = static_cast<int>(pixel(360, 439) & 255);
        constexpr int least = red & 255;
        return (part - least) / static_cast<double>((blue & 255) - least);
    }
    void say(const char* signal) { elm_layout_signal_emit(pages_[0], signal, ""); }
};

TEST_F(TouchMarker, IsHiddenAtRest) {
    show();
    EXPECT_EQ(0, seen());
}

TEST_F(TouchMarker, AppearsAndPulsesCalmly) {
    show();
    say("touch,show");
    test_ui::runFor(0.1);
    EXPECT_GT(seen(), 0.1);
    EXPECT_LT(seen(), 0.9) << "it fades in";
    test_ui::runFor(0.27);
    EXPECT_GT(seen(), 0.95);
    for (int pulse = 0; pulse < 2; ++pulse) {
        test_ui::runFor(0.5);
        EXPECT_LT(seen(), 0.55);
        EXPECT_GT(seen(), 0.35) << "it does not go away";
        test_ui::runFor(0.5);
        EXPECT_GT(seen(), 0.95);
    }
}

TEST_F(TouchMarker, StandsStillInTheEnd) {
    show();
    say("touch,show");
    test_ui::runFor(4);
    const auto before = screen().picture();
    test_ui::runFor(0.4);
    EXPECT_EQ(before, screen().picture());
    EXPECT_EQ(1, seen());
}

TEST_F(TouchMarker, GoesAwayAtAnyMomentForGood) {
    show();
    for (const double moment : {0.1, 0.5, 1.1, 3.0}) {
        say("touch,show");
        test_ui::runFor(moment);
        say("touch,hide");
        test_ui::runFor(0.3);
        EXPECT_EQ(0, seen()) << moment;
        test_ui::runFor(2);
        EXPECT_EQ(0, seen()) << moment;
    }
}

TEST_F(TouchMarker, ComesBackAfterItWasHidden) {
    show();
    say("touch,show");
    test_ui::runFor(0.6);
    say("touch,hide");
    say("touch,show");
    test_ui::runFor(0.45);
    EXPECT_GT(seen(), 0.6);
    test_ui::runFor(4);
    EXPECT_EQ(1, seen());
}

}  // namespace
