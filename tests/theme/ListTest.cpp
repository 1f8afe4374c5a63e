#include "ScreenTest.h"

namespace {

using test_ui::Rect;
using testing::ElementsAre;

constexpr unsigned int lightPage = 0xF7F8FA;
constexpr unsigned int darkPage = 0x0E1116;
constexpr unsigned int lightPressed = 0xDCEBEF;
constexpr unsigned int iconRed = 0xC80000;

class List : public ScreenTest {};

TEST_F(List, FillsTheLargeDisplayPixelByPixel) {
    start();
    EXPECT_THAT(rowGeometries(pushList(threeRows())), ElementsAre(Rect{0, 112, 720, 76}, Rect{0, 188, 720, 148},
                                                                  Rect{0, 336, 720, 148}, Rect{0, 484, 720, 148}));
}

TEST_F(List, ShrinksOnTheSmallDisplay) {
    start(false);
    EXPECT_THAT(rowGeometries(pushList(threeRows())),
                ElementsAre(Rect{0, 73, 480, 50}, Rect{0, 123, 480, 97}, Rect{0, 220, 480, 97}, Rect{0, 317, 480, 97}));
}

TEST_F(List, IsLightOrDarkAsTheDeviceIs) {
    start();
    pushList(threeRows());
    EXPECT_EQ(lightPage, screen().picture().pixel(5, 1200));
    EXPECT_EQ(lightPage, screen().picture().pixel(5, 250));
    uxt::applyDeviceTheme(true);
    EXPECT_EQ(darkPage, screen().picture().pixel(5, 1200));
    EXPECT_EQ(darkPage, screen().picture().pixel(5, 250));
}

TEST_F(List, ShowsTheIconInTheDevicesShape) {
    start();
    pushList(threeRows());
    const auto picture = screen().picture();
    EXPECT_EQ(iconRed, picture.pixel(36 + 46, 188 + 28 + 46));
    EXPECT_EQ(iconRed, picture.pixel(36 + 46, 188 + 28 + 2));
    EXPECT_EQ(lightPage, picture.pixel(36, 188 + 28));
    EXPECT_EQ(lightPage, picture.pixel(36 + 91, 188 + 28 + 91));
    EXPECT_EQ(0, picture.count(iconRed, {36 + 92, 188, 100, 148}));
}

TEST_F(List, DrawsAHairlineBetweenRowsOnly) {
    start();
    pushList(threeRows());
    const auto picture = screen().picture();
    constexpr unsigned int line = 0xDDE1E7;
    for (const int bottom : {335, 483}) {
        EXPECT_EQ(line, picture.pixel(400, bottom));
        EXPECT_EQ(line, picture.pixel(156, bottom));
        EXPECT_EQ(lightPage, picture.pixel(155, bottom));
        EXPECT_EQ(lightPage, picture.pixel(400, bottom + 1));
    }
    EXPECT_EQ(lightPage, picture.pixel(400, 631));
}

TEST_F(List, AnswersAFingerAtOnceAndForgetsItCalmly) {
    start();
    Evas_Object* list = pushList(threeRows());
    screen().press({400, 250});
    test_ui::runFor(0.05);
    EXPECT_THAT(screen().picture().pixel(20, 262), LooksLike(lightPressed));
    EXPECT_EQ(lightPage, screen().picture().pixel(20, 262 + 148));
    screen().lift();
    elm_genlist_item_selected_set(elm_genlist_selected_item_get(list), EINA_FALSE);
    test_ui::runFor(0.1);
    EXPECT_NE(lightPage, screen().picture().pixel(20, 262));
    test_ui::runFor(0.2);
    EXPECT_EQ(lightPage, screen().picture().pixel(20, 262));
}

TEST_F(List, CutsALongTextBeforeTheMargin) {
    start();
    pushList({{"Music and everything else that can be heard, in one very long name of an application, or two",
               "Control music from your wrist, even when the phone is far away from you"}});
    const auto picture = screen().picture();
    EXPECT_GT(picture.colours({600, 188, 84, 140}), 1);
    EXPECT_EQ(1, picture.colours({684, 188, 36, 140}));
}

TEST_F(List, DrawsALettersHookAtTheStartOfARow) {
    start();
    pushList({{"Exercise", "J"}, {"Exercise", "JJ"}});
    const auto picture = screen().picture();
    const auto inkOfRow = [&](int row) {
        int ink = 0;
        for (int y = 0; y < 60; ++y) {
            for (int x = 0; x < 100; ++x) {
                ink += static_cast<int>(lightPage & 255) -
                       static_cast<int>(picture.pixel(140 + x, 188 + 148 * row + 70 + y) & 255);
            }
        }
        return ink;
    };
    EXPECT_GT(inkOfRow(0), 10000);
    EXPECT_NEAR(1, 2.0 * inkOfRow(0) / inkOfRow(1), 0.02) << "only the first letter of a text can be cut";
}

TEST_F(List, IsMirroredWhereOneReadsFromRightToLeft) {
    start();
    elm_config_mirrored_set(EINA_TRUE);
    pushList({{"Phone", "Calls"}});
    const auto picture = screen().picture();
    EXPECT_EQ(iconRed, picture.pixel(719 - 36 - 46, 188 + 74));
    EXPECT_GT(picture.colours({464, 200, 100, 120}), 1);
    EXPECT_EQ(1, picture.colours({36, 200, 200, 120}));
    EXPECT_GT(picture.colours({584, 20, 100, 80}), 1);
    EXPECT_EQ(1, picture.colours({36, 20, 400, 80}));
}

TEST_F(List, ShowsAThumbWhileItMovesOnly) {
    start();
    pushList(std::vector<Row>(30, {"Phone", "Answer calls"}));
    const Rect edge{704, 120, 14, 1160};
    EXPECT_EQ(1, screen().picture().colours(edge));
    screen().swipe({300, 1000}, {300, 600}, 0.3);
    test_ui::runFor(0.05);
    EXPECT_GT(screen().picture().colours(edge), 1);
    test_ui::runFor(5);
    EXPECT_EQ(1, screen().picture().colours(edge));
}

TEST_F(List, ShowsAHairlineBelowTheTitleBarWhileThereIsMoreAbove) {
    start();
    pushList(std::vector<Row>(30, {"Phone", "Answer calls"}));
    EXPECT_EQ(lightPage, screen().picture().pixel(5, 112));
    screen().swipe({300, 1000}, {300, 600}, 0.3);
    test_ui::runFor(5);
    EXPECT_EQ(0xDDE1E7u, screen().picture().pixel(5, 112));
    for (int flick = 0; flick < 5; ++flick) {
        screen().swipe({300, 300}, {300, 1200});
        test_ui::runFor(3);
    }
    EXPECT_EQ(lightPage, screen().picture().pixel(5, 112));
}

TEST_F(List, RingsTheRowThatHasTheFocusOfTheKeys) {
    start();
    pushList(threeRows());
    constexpr unsigned int ring = 0x0A6577;
    const auto first = [&] { return screen().picture().pixel(13, 188 + 74); };
    const auto second = [&] { return screen().picture().pixel(13, 336 + 74); };
    EXPECT_EQ(lightPage, first());
    screen().key("Down");
    screen().key("Down");
    test_ui::runFor(0.5);
    EXPECT_THAT(first(), LooksLike(ring));
    EXPECT_EQ(lightPage, second());
    screen().key("Down");
    test_ui::runFor(0.5);
    EXPECT_EQ(lightPage, first());
    EXPECT_THAT(second(), LooksLike(ring));
}

}  // namespace
