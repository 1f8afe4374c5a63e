#include "PictureTest.h"

#include "KestPictureArea.h"

#include <device/Keys.h>

#include <fstream>

namespace fs = std::filesystem;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Not;

/// A picture or a marker that cannot be read, or that the page has no room for: what stands in its place.
class PictureFallback : public PictureTest {
protected:
    void makeText(const std::string& path) {
        toolkit_.log().expect("Failed to load image");
        support::writeFile(path, "no picture at all, but long enough to be taken for one");
    }
    static void cut(const std::string& path) { fs::resize_file(path, fs::file_size(path) / 2); }
    void useRussian() const { device()->settings().set(device::keys::language, "ru_RU.UTF-8"); }

    static kest_log::Line noPicture(const std::string& path) {
        return warning("__createReadableImage", "no picture: " + path);
    }
    static kest_log::Line breaksOff(const std::string& path) {
        return warning("__setFile", "the file breaks off: " + path);
    }
    static kest_log::Line noRoom(const std::string& size, const std::string& path) {
        return warning("__createReadableImage", size + " pixels are more than the page has left: " + path);
    }
    /// What the log warns of while the pictures are built.
    std::vector<kest_log::Line> warnings() { return kest_log::ofLevel('W', buildLog()); }
};

TEST_F(PictureFallback, OfATextAsTheFirstPictureIsThePlaceholder) {
    drawSequence(3);
    makeText(picturePath("a_01.png"));
    openPage();
    EXPECT_THAT(filesIn(pictures()), ElementsAre(placeholder(), picturePath("a_02.png"), picturePath("a_03.png")));
    EXPECT_THAT(warnings(), ElementsAre(noPicture(picturePath("a_01.png"))));
}

TEST_F(PictureFallback, OfATextAsALaterPictureIsThePlaceholder) {
    drawSequence(3);
    makeText(picturePath("a_03.png"));
    openPage();
    EXPECT_THAT(filesIn(pictures()), ElementsAre(picturePath("a_01.png"), picturePath("a_02.png"), placeholder()));
    EXPECT_THAT(warnings(), ElementsAre(noPicture(picturePath("a_03.png"))));
}

TEST_F(PictureFallback, OfATruncatedPictureIsThePlaceholder) {
    const std::string picture = drawPicture("a_01.png");
    cut(picture);
    openPage();
    EXPECT_TRUE(showsPlaceholder());
    EXPECT_THAT(warnings(), ElementsAre(breaksOff(picture), warning("__buildSingle", "no picture: " + picture)));
}

TEST_F(PictureFallback, OfATruncatedTallPictureIsThePlaceholder) {
    cut(drawPicture("a_01.png", 716, 900));
    openPage();
    EXPECT_TRUE(showsPlaceholder());
}

TEST_F(PictureFallback, OfATruncatedFirstPictureOfASequenceIsThePlaceholder) {
    drawSequence(2);
    cut(picturePath("a_01.png"));
    openPage();
    EXPECT_THAT(filesIn(pictures()), ElementsAre(placeholder(), picturePath("a_02.png")));
    EXPECT_THAT(warnings(), ElementsAre(breaksOff(picturePath("a_01.png")), noPicture(picturePath("a_01.png"))));
}

TEST_F(PictureFallback, OfATruncatedLaterPictureIsThePlaceholder) {
    drawSequence(2);
    cut(picturePath("a_02.png"));
    openPage();
    EXPECT_THAT(filesIn(pictures()), ElementsAre(picturePath("a_01.png"), placeholder()));
    EXPECT_THAT(warnings(), ElementsAre(breaksOff(picturePath("a_02.png")), noPicture(picturePath("a_02.png"))));
}

TEST_F(PictureFallback, IsSeenWhereThePictureWouldBe) {
    drawPicture("../contents_not_released.png", 716, 655, 0xAA3300);
    drawSequence(2);
    cut(picturePath("a_01.png"));
    openPage();
    settle();
    const test_ui::Point middle = test_ui::geometry(video()).middle();
    EXPECT_TRUE(test_ui::runUntil([&] { return screen().picture().pixel(middle.x, middle.y) == 0xAA3300U; }, 600));
}

TEST_F(PictureFallback, OfAPictureWithWordsBehindItsEndIsItself) {
    const std::string picture = drawPicture("a_01.png");
    std::ofstream(picture, std::ios::app) << "words that some program has left behind";
    openPage();
    EXPECT_EQ(fileIn(video(), "page"), picture);
    EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(PictureFallback, OfARussianPictureIsThePicture) {
    const std::string picture = drawPicture("a_01.png");
    const std::string russian = drawPicture("a_russia_01.png");
    makeText(russian);
    useRussian();
    openPage();
    EXPECT_EQ(fileIn(video(), "page"), picture);
    EXPECT_THAT(warnings(), ElementsAre(noPicture(russian)));
}

TEST_F(PictureFallback, OfATruncatedRussianPictureOfASequenceIsThePicture) {
    drawSequence(2);
    const std::string russian = drawPicture("a_russia_02.png");
    cut(russian);
    useRussian();
    openPage();
    EXPECT_THAT(filesIn(pictures()), ElementsAre(picturePath("a_01.png"), picturePath("a_02.png")));
    EXPECT_THAT(warnings(), ElementsAre(breaksOff(russian), noPicture(russian)));
}

TEST_F(PictureFallback, OfBothIsThePlaceholder) {
    drawSequence(2);
    const std::string russian = drawPicture("a_russia_02.png");
    makeText(russian);
    makeText(picturePath("a_02.png"));
    useRussian();
    openPage();
    EXPECT_THAT(filesIn(pictures()), ElementsAre(picturePath("a_01.png"), placeholder()));
    EXPECT_THAT(warnings(), ElementsAre(noPicture(russian), noPicture(picturePath("a_02.png"))));
}

TEST_F(PictureFallback, OfAMarkerIsNone) {
    drawSequence(2, {0});
    makeText(picturePath("a_01_touch.png"));
    openPage();
    EXPECT_EQ(elm_object_part_content_get(pictures()[0], "page.touch"), nullptr);
    EXPECT_THAT(warnings(), ElementsAre(noPicture(picturePath("a_01_touch.png"))));
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), testing::IsSupersetOf({"0.0 picture 0 touch,hide", "2.0 pictures to page 1",
                                                       "4.0 pictures to page 0", "4.0 area reply,show"}));
    EXPECT_THAT(calls::story(), Not(Contains(testing::HasSubstr("touch,show"))));
}

TEST_F(PictureFallback, OfATruncatedMarkerIsNone) {
    drawSequence(3, {1});
    cut(picturePath("a_02_touch.png"));
    openPage();
    EXPECT_THAT(filesIn(pictures(), "page.touch"), ElementsAre("", "", ""));
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), testing::IsSupersetOf({"2.0 pictures to page 1", "4.0 pictures to page 2"}));
}

TEST_F(PictureFallback, KeepsAPictureOfFourMillionPixels) {
    const std::string picture = drawPicture("a_01.png", 2048, 2048);
    openPage();
    EXPECT_EQ(fileIn(elm_object_content_get(pictureScroller()), "page"), picture);
    EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(PictureFallback, OfAPictureOfOneLineMoreIsThePlaceholder) {
    const std::string picture = drawPicture("a_01.png", 2048, 2049);
    openPage();
    EXPECT_TRUE(showsPlaceholder());
    EXPECT_THAT(warnings(), ElementsAre(warning("__setFile", "2048 x 2049 pixels are too many: " + picture),
                                        warning("__buildSingle", "no picture: " + picture)));
}

TEST_F(PictureFallback, IsNotNeededForAllPicturesAndMarkersOfTheAreasSize) {
    std::set<int> all;
    for (int picture = 0; picture < KestPictureArea::mostPages; ++picture)
        all.insert(picture);
    drawSequence(KestPictureArea::mostPages, all);
    openPage();
    EXPECT_THAT(filesIn(pictures()), Not(Contains(placeholder())));
    EXPECT_THAT(filesIn(pictures(), "page.touch"), Not(Contains("")));
    EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(PictureFallback, OfWhatThePageHasNoRoomForKeepsMemoryBounded) {
    const std::string large = drawPicture("large.png", 2048, 2048);
    for (int number = 1; number <= KestPictureArea::mostPages; ++number) {
        const std::string name = std::string(number < 10 ? "a_0" : "a_") + std::to_string(number);
        fs::copy_file(large, picturePath(name + ".png"));
        fs::copy_file(large, picturePath(name + "_touch.png"));
    }
    // 2,424,448 pixels are left behind three large ones: for five of the area's size.
    fs::remove(picturePath("a_04.png"));
    drawPicture("a_04.png");
    drawPicture("b_01.png");
    writeTips({tip("b_01.png"), tip("a_01.png")});
    const std::size_t room = std::size_t{2} * KestPictureArea::mostPages * 716 * 655 * 4;
    open();
    const std::size_t before = memory();
    swipe();
    ASSERT_TRUE(test_ui::runUntil([&] { return PagerTest::info(1) != nullptr; }));
    test_ui::runFor(20);

    std::vector<std::string> files(KestPictureArea::mostPages, placeholder());
    files[0] = picturePath("a_01.png");
    files[1] = picturePath("a_02.png");
    files[3] = picturePath("a_04.png");
    EXPECT_EQ(filesIn(pictures(1)), files);
    std::vector<std::string> markers(KestPictureArea::mostPages);
    markers[0] = picturePath("a_01_touch.png");
    EXPECT_EQ(filesIn(pictures(1), "page.touch"), markers);
    EXPECT_THAT(warnings(), testing::IsSupersetOf({noRoom("2048 x 2048", picturePath("a_02_touch.png")),
                                                   noRoom("2048 x 2048", picturePath("a_03.png"))}));
    EXPECT_LT(memory(), before + room + 20 * 1024 * 1024);
}
