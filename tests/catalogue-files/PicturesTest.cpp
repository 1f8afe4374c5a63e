#include "Pictures.h"

#include "Png.h"
#include "support/TemporaryFolder.h"

#include <gmock/gmock.h>

namespace catalogue {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr std::uint32_t ground = 0xffdce8ec;

/// A tip that shows two pictures, the first with a marker and a Russian variant; each test breaks one rule.
class PicturesTest : public testing::Test {
protected:
    PicturesTest() {
        tip_.path = "contents/faces.xml";
        tip_.sharedResources = folder_.path();
        tip_.detail.file = "faces.xml";
        tip_.detail.image = {"contents/images/faces_01.png", 8};
        write("faces_01.png", picture());
        write("faces_02.png", picture());
        write("faces_01_touch.png", marker());
        write("faces_russia_01.png", picture());
    }

    static Bitmap picture(std::size_t width = 716, std::size_t height = 655) {
        Bitmap bitmap(width, height, ground);
        bitmap.at(width / 2, height / 2) = 0xff000000;
        return bitmap;
    }
    static Bitmap marker() {
        Bitmap bitmap(716, 655, 0);
        bitmap.at(358, 327) = 0x80ff7a2b;
        return bitmap;
    }
    std::filesystem::path file(const std::string& name) const { return folder_.path() / "contents/images" / name; }
    void write(const std::string& name, const Bitmap& bitmap) const { writePng(file(name), bitmap); }
    void keepOnlyTheFirst() const {
        for (const char* name : {"faces_02.png", "faces_01_touch.png", "faces_russia_01.png"})
            std::filesystem::remove(file(name));
    }

    support::TemporaryFolder folder_;
    Tip tip_;
};

TEST_F(PicturesTest, OfAGoodTipFitThePage) {
    EXPECT_THAT(picturesFitThePage(tip_), IsEmpty());
    EXPECT_THAT(picturesBelongToTips({tip_}), IsEmpty());
}

TEST_F(PicturesTest, MayBeLeftOut) {
    std::filesystem::remove_all(file(""));
    tip_.detail.image = {};
    EXPECT_THAT(picturesFitThePage(tip_), IsEmpty());
    EXPECT_THAT(picturesBelongToTips({tip_}), IsEmpty());
}

TEST_F(PicturesTest, BeginWithNumberOne) {
    tip_.detail.image.text = "contents/images/faces_02.png";
    EXPECT_THAT(picturesFitThePage(tip_),
                ElementsAre("faces.xml:8: the picture is called contents/images/faces_02.png, not "
                            "contents/images/faces_01.png"));
}

TEST_F(PicturesTest, HaveNoGap) {
    write("faces_04.png", picture());
    EXPECT_THAT(picturesFitThePage(tip_),
                ElementsAre("faces.xml:8: faces_04.png is not shown: there is none before it"));
}

TEST_F(PicturesTest, AreSixteenAtMost) {
    for (int number = 3; number <= 16; ++number)
        write("faces_" + std::string(number < 10 ? "0" : "") + std::to_string(number) + ".png", picture());
    EXPECT_THAT(picturesFitThePage(tip_), IsEmpty());
    write("faces_17.png", picture());
    EXPECT_THAT(picturesFitThePage(tip_), ElementsAre("faces.xml:8: 17 pictures, at most 16 fit"));
}

TEST_F(PicturesTest, HaveNoMarkerOfTheirOwnWithoutAPicture) {
    write("faces_03_touch.png", marker());
    write("faces_russia_03.png", picture());
    EXPECT_THAT(picturesFitThePage(tip_), ElementsAre("faces.xml:8: faces_03_touch.png belongs to no picture",
                                                      "faces.xml:8: faces_russia_03.png belongs to no picture"));
}

TEST_F(PicturesTest, HaveNoMarkerOnTheLast) {
    write("faces_02_touch.png", marker());
    EXPECT_THAT(picturesFitThePage(tip_),
                ElementsAre("faces.xml:8: faces_02_touch.png would stay: nothing follows the last picture"));
}

TEST_F(PicturesTest, HaveNoRussianMarker) {
    write("faces_russia_01_touch.png", marker());
    EXPECT_THAT(picturesFitThePage(tip_),
                ElementsAre("faces.xml:8: faces_russia_01_touch.png is not shown: the marker of the first variant "
                            "serves both"));
}

TEST_F(PicturesTest, ArePngFiles) {
    support::writeFile(file("faces_02.png"), "GIF89a");
    support::writeFile(file("faces_01_touch.png"), support::readFile(file("faces_01.png")).substr(0, 100));
    EXPECT_THAT(picturesFitThePage(tip_),
                ElementsAre("faces.xml:8: faces_02.png is no PNG", "faces.xml:8: faces_01_touch.png is no PNG"));
}

TEST_F(PicturesTest, HaveTheSizeOfThePage) {
    write("faces_01.png", picture(715, 655));
    write("faces_02.png", picture(716, 1400));
    write("faces_01_touch.png", Bitmap(716, 656, 0));
    EXPECT_THAT(picturesFitThePage(tip_),
                ElementsAre("faces.xml:8: faces_01.png is 715x655, not 716x655 or, alone, 716x756 to 716x1500",
                            "faces.xml:8: faces_02.png is 716x1400, not 716x655 or, alone, 716x756 to 716x1500",
                            "faces.xml:8: faces_01_touch.png is 716x656, not 716x655"));
}

TEST_F(PicturesTest, MayBeTallWhenTheyAreAlone) {
    keepOnlyTheFirst();
    for (const std::size_t height : {756u, 1500u}) {
        write("faces_01.png", picture(716, height));
        EXPECT_THAT(picturesFitThePage(tip_), IsEmpty()) << height;
    }
    for (const std::size_t height : {656u, 755u, 1501u}) {
        write("faces_01.png", picture(716, height));
        EXPECT_THAT(picturesFitThePage(tip_), ElementsAre("faces.xml:8: faces_01.png is 716x" + std::to_string(height) +
                                                          ", not 716x655 or, alone, 716x756 to 716x1500"));
    }
}

TEST_F(PicturesTest, HaveNoRussianVariantWhenTheyAreTall) {
    keepOnlyTheFirst();
    write("faces_01.png", picture(716, 1400));
    write("faces_russia_01.png", picture());
    EXPECT_THAT(picturesFitThePage(tip_),
                ElementsAre("faces.xml:8: faces_01.png has a Russian variant, which is not shown of a tall picture"));
}

TEST_F(PicturesTest, HaveABorderInTheGroundColour) {
    const std::pair<std::size_t, std::size_t> places[] = {{0, 0},     {715, 654}, {300, 0},
                                                          {300, 654}, {0, 300},   {715, 300}};
    for (const auto& [x, y] : places) {
        Bitmap bitmap = picture();
        bitmap.at(x, y) = 0xffdce8ed;
        write("faces_russia_01.png", bitmap);
        EXPECT_THAT(picturesFitThePage(tip_),
                    ElementsAre("faces.xml:8: faces_russia_01.png has another border than #DCE8EC"))
            << x << "," << y;
    }
}

TEST_F(PicturesTest, HaveMarkersThatAreAMarkAndNothingElse) {
    write("faces_01_touch.png", Bitmap(716, 655, 0));
    EXPECT_THAT(picturesFitThePage(tip_), ElementsAre("faces.xml:8: faces_01_touch.png is empty"));
    write("faces_01_touch.png", picture());
    EXPECT_THAT(picturesFitThePage(tip_), ElementsAre("faces.xml:8: faces_01_touch.png reaches the border"));
}

TEST_F(PicturesTest, BelongToATip) {
    write("faces_1.png", picture());
    write("other_01.png", picture());
    EXPECT_THAT(picturesBelongToTips({tip_}), ElementsAre(file("faces_1.png").string() + ": no tip shows it",
                                                          file("other_01.png").string() + ": no tip shows it"));
    Tip other = tip_;
    other.path = "contents/other.xml";
    other.detail.image = {"contents/images/other_01.png", 8};
    EXPECT_THAT(picturesBelongToTips({tip_, other}), ElementsAre(file("faces_1.png").string() + ": no tip shows it"));
}

}  // namespace
}  // namespace catalogue
