#include "PagerTest.h"

using testing::AllOf;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

/// The pager has room for so many pages, and a page for so many pictures. Going past that ends the process.
class Capacity : public PagerTest {
protected:
    void writeTipsOfNumber(int count) const {
        writeTips(std::vector<std::string>(static_cast<std::size_t>(count), tip("none.png")));
    }
};

TEST_F(Capacity, OfFifteenMenusIsEnough) {
    writeTipsOfNumber(15);
    open(14);
    settle();
    EXPECT_EQ(pager().getPageCount(), 15);
    EXPECT_EQ(title(), "Tips 15/15");
    EXPECT_EQ(test_ui::plainText(entry(14)), "Text");
}

TEST_F(Capacity, OfSixteenMenusEndsTheProcess) {
    writeTipsOfNumber(16);
    startEmpty();
    EXPECT_DEATH(Pager(2, true), AllOf(HasSubstr("KestContentView.cpp:"),
                                       HasSubstr("KestContentView: Assertion `(menus <= mostPages)' failed.")));
    EXPECT_THAT(newErrors(), ElementsAre(kest_log::error(
                                 pager_log::file, "KestContentView",
                                 "WASSERT! the catalogue has 16 menus, more than the 15 pages of the pager")));
}

TEST_F(Capacity, OfSixteenPicturesInASequenceShowsThemAll) {
    drawSequence(16);
    writeTip();
    open();
    EXPECT_EQ(pictures().size(), 16U);
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(Capacity, OfSeventeenPicturesInASequenceEndsTheProcess) {
    drawSequence(17);
    writeTip();
    startEmpty();
    EXPECT_DEATH(open(), AllOf(HasSubstr("KestPictureArea.cpp:"),
                               HasSubstr("addPage: Assertion `(pageCount < mostPages)' failed.")));
    EXPECT_THAT(newErrors(), ElementsAre(kest_log::error("KestPictureArea.cpp", "addPage",
                                                         "WASSERT! the sequence goes on after 16 pictures: " +
                                                             picturePath("a_17.png"))));
}

TEST_F(Capacity, OfASequenceThatGoesRoundEndsTheProcess) {
    // 92 to 99, then 10 and so on, until there are too many.
    drawPicture("a.png");
    for (int number = 10; number < 100; ++number)
        std::filesystem::create_symlink("a.png", picturePath("a_" + std::to_string(number) + ".png"));
    writeTips({tip("a_91.png")});
    startEmpty();
    EXPECT_DEATH(open(), HasSubstr("Assertion `(pageCount < mostPages)' failed."));
}
