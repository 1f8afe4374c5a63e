#include "PictureTest.h"

#include <device/Keys.h>

using testing::Contains;
using testing::ElementsAre;

/// The same page for other languages and displays.
class PictureVariant : public PictureTest {
protected:
    void useRussian() const { device()->settings().set(device::keys::language, "ru_RU.UTF-8"); }
};

TEST_F(PictureVariant, ForRussianTakesThePlaceOfThePicture) {
    drawPicture("a_01.png");
    const std::string russian = drawPicture("a_russia_01.png");
    useRussian();
    openPage();
    EXPECT_EQ(fileIn(video(), "page"), russian);
    EXPECT_THAT(buildLog(), Contains(info("isRussian", "locale = ru_RU")));
}

TEST_F(PictureVariant, ForRussianIsOfNoUseToOthers) {
    const std::string picture = drawPicture("a_01.png");
    drawPicture("a_russia_01.png");
    openPage();
    EXPECT_EQ(fileIn(video(), "page"), picture);
}

TEST_F(PictureVariant, ForRussianIsOfNoUseToRussianOfAnotherCountry) {
    const std::string picture = drawPicture("a_01.png");
    drawPicture("a_russia_01.png");
    device()->settings().set(device::keys::language, "ru_UA.UTF-8");
    openPage();
    EXPECT_EQ(fileIn(video(), "page"), picture);
    EXPECT_THAT(buildLog(), Contains(info("isRussian", "locale = ru_UA")));
}

TEST_F(PictureVariant, ForRussianNeedNotBeThere) {
    const std::string picture = drawPicture("a_01.png");
    useRussian();
    openPage();
    EXPECT_EQ(fileIn(video(), "page"), picture);
}

TEST_F(PictureVariant, ForRussianIsLookedForPictureByPicture) {
    drawSequence(3, {1});
    drawPicture("a_russia_02.png");
    useRussian();
    openPage();
    EXPECT_THAT(filesIn(pictures()),
                ElementsAre(picturePath("a_01.png"), picturePath("a_russia_02.png"), picturePath("a_03.png")));
    EXPECT_THAT(filesIn(pictures(), "page.touch"), ElementsAre("", picturePath("a_02_touch.png"), ""));
}

TEST_F(PictureVariant, ForRussianAloneGoesOnWithNoSequence) {
    drawSequence(2);
    drawPicture("a_russia_03.png");
    useRussian();
    openPage();
    EXPECT_THAT(filesIn(pictures()), ElementsAre(picturePath("a_01.png"), picturePath("a_02.png")));
}

TEST_F(PictureVariant, ForRussianIsNoFolderThatTheCutPathNames) {
    const std::string picture = drawPicture("a01.png");
    ASSERT_EQ(picture.find('_'), std::string::npos);
    useRussian();
    openPage("a01.png");
    EXPECT_THAT(buildLog(), Contains(info("__createPage", "imagePath_russia = " + picturePath(""))));
    EXPECT_EQ(fileIn(video(), "page"), picture);
}

TEST_F(PictureVariant, ForRussianIsNotLookedForBesideATallPicture) {
    const std::string picture = drawPicture("a_01.png", 716, 800);
    drawPicture("a_russia_01.png", 716, 800);
    useRussian();
    openPage();
    EXPECT_EQ(fileIn(elm_object_content_get(pictureScroller()), "page"), picture);
}

TEST_F(PictureVariant, WithoutALocaleIsThePicture) {
    const std::string picture = drawPicture("a_01.png");
    writeTips({tip("a_01.png")});
    startEmpty();
    device::faults::plan("system_settings_get_value_string", -5);
    open();
    EXPECT_EQ(fileIn(video(), "page"), picture);
    EXPECT_THAT(buildLog(), Contains(info("isRussian", "locale = ")));
}

TEST_F(PictureVariant, OfADisplayThatLeaves601PixelsIsAsHighAsItsWidthAsks) {
    drawPicture("a_01.png");
    calls::setScreenWidth(605);
    openPage();
    EXPECT_EQ(groupOf(video()), "layout/multi_image/page");
    EXPECT_EQ(sizeOf(video()), (Size{601, 549}));
}

TEST_F(PictureVariant, OfADisplayThatLeaves600PixelsIs369High) {
    drawPicture("a_01.png");
    calls::setScreenWidth(604);
    openPage();
    EXPECT_EQ(groupOf(video()), "layout/multi_image/hpage");
    EXPECT_EQ(sizeOf(video()), (Size{600, 369}));
}

TEST_F(PictureVariant, OfTheSmallDisplayIs478x369) {
    drawSequence(2);
    useSmallScreen();
    openPage();
    for (Evas_Object* picture : pictures()) {
        EXPECT_EQ(groupOf(picture), "layout/multi_image/hpage");
        EXPECT_EQ(sizeOf(picture), (Size{478, 369}));
    }
}

TEST_F(PictureVariant, IsAsWideAsTheDisplayOfTheApplicationsWindow) {
    drawSequence(2);
    openPage();
    EXPECT_THAT(calls::windowsAskedForTheScreen(), ElementsAre(running().window(), running().window()));
}

TEST_F(PictureVariant, OfALowDensityDisplayIsToldByTheImageResourceOfTheColours) {
    drawPicture("a_01.png", 716, 800);
    openPage();
    EXPECT_THAT(calls::steps({"resource"}), Contains("resource 0 table/com.ravella.kest_ChangeableColorInfo.xml"));
}

TEST_F(PictureVariant, OfALowDensityDisplayIsATallPicture138PixelsLower) {
    drawPicture("a_01.png", 716, 1000);
    useSmallScreen();
    openPage();
    EXPECT_EQ(groupOf(elm_object_content_get(pictureScroller())), "layout/multi_image/page") << "for a tall one always";
    // 1000 at 478 of 716 pixels' width are 667.
    EXPECT_EQ(sizeOf(elm_object_content_get(pictureScroller())), (Size{-1, 667 - 138}));
}

TEST_F(PictureVariant, IsDrawnByTheThemesFileOfTheDisplaysDensityAsTheWholePageIs) {
    drawPicture("a_01.png");
    const auto theme = device().appRoot() / "res/LDPI/edje/kest.edj";
    std::filesystem::create_directories(theme.parent_path());
    std::filesystem::copy_file(device().appRoot() / "res/edje/kest.edj", theme);
    device()->settings().set(device::keys::screen, "480x800");
    openPage();
    for (Evas_Object* layout : {page(), video(), infoLayout()}) {
        const char* file = nullptr;
        elm_layout_file_get(layout, &file, nullptr);
        EXPECT_STREQ(file, theme.c_str()) << groupOf(layout);
    }
}

TEST_F(PictureVariant, OfASmallDisplayWithoutResourcesOfItsOwnIsATallPictureWhole) {
    drawPicture("a_01.png", 716, 1000);
    device()->settings().set(device::keys::screen, "480x800");
    openPage();
    EXPECT_EQ(sizeOf(elm_object_content_get(pictureScroller())), (Size{478, 667}));
}
