#include "PictureTest.h"

#include "KestContentMgr.h"
#include "KestPaths.h"

#include <dlfcn.h>
#include <sys/stat.h>

namespace fs = std::filesystem;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Not;

namespace {

/// The heights of the pictures that were set to be decoded by a thread.
std::vector<int> decoded;

}  // namespace

/// The program's definition comes before the library's own, also for the other libraries.
extern "C" __attribute__((visibility("default"))) void evas_object_image_preload(Evas_Object* image, Eina_Bool cancel) {
    static const auto own =
        reinterpret_cast<decltype(&evas_object_image_preload)>(dlsym(RTLD_NEXT, "evas_object_image_preload"));
    int height = 0;
    evas_object_image_size_get(image, nullptr, &height);
    if (!cancel)
        decoded.push_back(height);
    own(image, cancel);
}

/// Pictures that are not what they ought to be. The page stays usable.
class PictureFault : public PictureTest {
protected:
    /// What is read and launched stands as on every page, and the log tells of no error.
    void expectUsablePage() {
        EXPECT_EQ(test_ui::plainText(entry()), "Text");
        EXPECT_EQ(title(), "Tips 1/1");
        EXPECT_THAT(newErrors(), IsEmpty());
    }
    static void cutTo(const fs::path& file, std::uintmax_t bytes) { fs::resize_file(file, bytes); }
};

TEST_F(PictureFault, MissingShowsThePlaceholder) {
    openPage();
    EXPECT_TRUE(showsPlaceholder());
    EXPECT_TRUE(evas_object_visible_get(video()));
    EXPECT_THAT(buildLog(), ElementsAre(info("__createImage", "imagePath : " + placeholder())));
    expectUsablePage();
}

TEST_F(PictureFault, MissingAsTheFirstOfASequenceShowsThePlaceholder) {
    drawPicture("a_02.png");
    openPage();
    EXPECT_TRUE(showsPlaceholder());
    expectUsablePage();
}

TEST_F(PictureFault, NoImageElementShowsThePlaceholder) {
    writeTips({"<title>Title</title>" + kest_files::contents("Text")});
    open();
    EXPECT_TRUE(showsPlaceholder());
    expectUsablePage();
}

TEST_F(PictureFault, AnEmptyImageElementShowsThePlaceholder) {
    writeTips({"<title>Title</title><image></image>" + kest_files::contents("Text")});
    open();
    EXPECT_TRUE(showsPlaceholder());
    expectUsablePage();
}

TEST_F(PictureFault, AFolderShowsThePlaceholder) {
    fs::create_directories(picturePath("a_01.png"));
    openPage();
    EXPECT_TRUE(showsPlaceholder());
    expectUsablePage();
}

TEST_F(PictureFault, AFifoShowsThePlaceholder) {
    fs::create_directories(picturePath(""));
    ASSERT_EQ(mkfifo(picturePath("a_01.png").c_str(), 0600), 0);
    openPage();
    EXPECT_TRUE(showsPlaceholder());
    expectUsablePage();
}

TEST_F(PictureFault, AFifoAsTheSecondPictureMakesNoSequence) {
    drawPicture("a_01.png");
    ASSERT_EQ(mkfifo(picturePath("a_02.png").c_str(), 0600), 0);
    openPage();
    EXPECT_EQ(groupOf(video()), "layout/multi_image/page");
    expectUsablePage();
}

TEST_F(PictureFault, AFifoAsATouchMarkerIsNone) {
    drawPicture("a_01.png");
    ASSERT_EQ(mkfifo(picturePath("a_01_touch.png").c_str(), 0600), 0);
    openPage();
    EXPECT_EQ(elm_object_part_content_get(video(), "page.touch"), nullptr);
    expectUsablePage();
}

TEST_F(PictureFault, AnEmptyFileShowsThePlaceholder) {
    toolkit_.log().expect("Failed to load image");
    support::writeFile(drawPicture("a_01.png"), "");
    openPage();
    EXPECT_TRUE(showsPlaceholder());
    EXPECT_THAT(newLog(), Contains(warning("__buildSingle", "no picture: " + picturePath("a_01.png"))));
    EXPECT_EQ(test_ui::plainText(entry()), "Text");
}

TEST_F(PictureFault, ATextShowsThePlaceholder) {
    toolkit_.log().expect("Failed to load image");
    support::writeFile(drawPicture("a_01.png"), "no picture at all, but long enough to be taken for one");
    openPage();
    EXPECT_TRUE(showsPlaceholder());
    expectUsablePage();
}

TEST_F(PictureFault, AHeadAloneShowsThePlaceholder) {
    cutTo(drawPicture("a_01.png"), 20);
    openPage();
    EXPECT_TRUE(showsPlaceholder());
    expectUsablePage();
}

TEST_F(PictureFault, ATruncatedPictureLeavesThePageUsable) {
    const std::string picture = drawPicture("a_01.png");
    cutTo(picture, fs::file_size(picture) / 2);
    openPage();
    test_ui::runFor(1);
    expectUsablePage();
}

TEST_F(PictureFault, APlaceholderThatIsMissingTooLeavesThePageUsable) {
    fs::remove(placeholder());
    openPage("missing.png");
    test_ui::runFor(1);
    expectUsablePage();
}

TEST_F(PictureFault, IsReplacedFromTheFixedFolderWhereTheApplicationManagerKnowsNone) {
    writeTips({tip("missing.png")});
    startEmpty();
    KestContentMgr::getInstance();
    device::faults::plan("app_manager_get_shared_resource_path", -5);
    open();
    EXPECT_THAT(buildLog(),
                ElementsAre(info("__createImage", std::string("imagePath : ") + kest_paths::sharedResources +
                                                      "contents/contents_not_released.png")));
}

TEST_F(PictureFault, TwentyThousandPixelsHighShowsThePlaceholder) {
    const std::string picture = drawPicture("a_01.png", 716, 20000);
    openPage();
    EXPECT_TRUE(showsPlaceholder());
    EXPECT_THAT(buildLog(), ElementsAre(info("build", "secondImagePath is " + picturePath("a_02.png")),
                                        info("__createImage", "imagePath : " + picture),
                                        warning("__setFile", "716 x 20000 pixels are too many: " + picture),
                                        info("__buildSingle", "weight:0, height:0"),
                                        warning("__buildSingle", "no picture: " + picture),
                                        info("__createImage", "imagePath : " + placeholder())));
    expectUsablePage();
}

TEST_F(PictureFault, TwentyThousandPixelsHighTakesNoMemory) {
    drawPicture("a_01.png", 716, 20000);
    drawPicture("b_01.png");
    writeTips({tip("b_01.png"), tip("a_01.png")});
    open();
    const std::size_t before = memory();
    swipe();
    test_ui::runFor(2);
    ASSERT_EQ(pageInView(), 1);
    EXPECT_LT(memory(), before + 20 * 1024 * 1024);
}

TEST_F(PictureFault, TwentyThousandPixelsHighIsNotEvenBegunToBeDecoded) {
    drawPicture("a_01.png", 716, 20000);
    drawPicture("b_01.png", 716, 370);
    writeTips({tip("b_01.png"), tip("a_01.png")});
    open();
    swipe();
    test_ui::runFor(2);
    ASSERT_EQ(pageInView(), 1);
    EXPECT_THAT(decoded, Contains(370));
    EXPECT_THAT(decoded, Not(Contains(20000)));
}

TEST_F(PictureFault, OfTooManyPixelsShowsThePlaceholderInItsPlaceInASequence) {
    drawSequence(3);
    const std::string large = drawPicture("a_02.png", 716, 20000);
    openPage();
    EXPECT_THAT(filesIn(pictures()), ElementsAre(picturePath("a_01.png"), placeholder(), picturePath("a_03.png")));
    EXPECT_THAT(newLog(), Contains(warning("__setFile", "716 x 20000 pixels are too many: " + large)));
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), testing::IsSupersetOf({"2.0 pictures to page 1", "4.0 pictures to page 2",
                                                       "6.0 pictures to page 0", "6.0 area reply,show"}));
}

TEST_F(PictureFault, WithoutALayoutLeavesTheAreaEmpty) {
    drawPicture("a_01.png");
    // The view's, the page's, then the picture's.
    calls::fail("elm_layout_add", 3);
    openPage();
    EXPECT_EQ(video(), nullptr);
    EXPECT_THAT(newErrors(), ElementsAre(error("__createPage", "create layout is fail")));
    EXPECT_EQ(test_ui::plainText(entry()), "Text");
}

TEST_F(PictureFault, WithoutALayoutIsLeftOutOfASequence) {
    drawSequence(2);
    // The view's, the page's, the area's and the first picture's, then that of the second.
    calls::fail("elm_layout_add", 5);
    openPage();
    EXPECT_THAT(filesIn(pictures()), ElementsAre(picturePath("a_01.png")));
    EXPECT_THAT(newErrors(), ElementsAre(error("__createPage", "create layout is fail")));
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), Contains("2.0 pictures to page 1"));
}

TEST_F(PictureFault, WithoutALayoutLeavesATallAreaEmpty) {
    drawPicture("a_01.png", 716, 900);
    calls::fail("elm_layout_add", 4);
    openPage();
    EXPECT_EQ(elm_object_content_get(pictureScroller()), nullptr);
    EXPECT_THAT(newErrors(), ElementsAre(error("__createVerticalPage", "create layout is fail")));
}

TEST_F(PictureFault, WithoutAnImageLeavesATallAreaEmpty) {
    drawPicture("a_01.png", 716, 900);
    // The first one measures the picture.
    calls::fail("elm_image_add", 2);
    openPage();
    EXPECT_EQ(elm_object_content_get(pictureScroller()), nullptr);
    EXPECT_THAT(newErrors(), ElementsAre(error("__createVerticalPage", "elm_image_add() is failed")));
    test_ui::runFor(20);
}
