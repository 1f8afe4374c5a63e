#include "KestPicturePaths.h"

#include "support/TemporaryFolder.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <sys/stat.h>

namespace fs = std::filesystem;

namespace {

/// A path of that length which ends in "_01.png".
std::string pathOfLength(std::size_t length) {
    const std::string end = "_01.png";
    return "/" + std::string(length - end.size() - 1, 'n') + end;
}

}  // namespace

TEST(SecondPicture, HasATwoInPlaceOfTheLastDigit) {
    EXPECT_EQ(KestPicturePaths::second("/p/wifi_01.png"), "/p/wifi_02.png");
}

TEST(SecondPicture, OfANameThatEndsInTwoIsThatItself) {
    EXPECT_EQ(KestPicturePaths::second("/p/wifi_02.png"), "/p/wifi_02.png");
}

TEST(SecondPicture, IsCountedFromTheEndWhateverStandsThere) {
    EXPECT_EQ(KestPicturePaths::second("/p/wifi_01.jpeg"), "/p/wifi_012jpeg");
    EXPECT_EQ(KestPicturePaths::second("/p/wifi"), "/p2wifi");
}

TEST(SecondPicture, OfFiveCharactersReplacesTheFirst) {
    EXPECT_EQ(KestPicturePaths::second("1.png"), "2.png");
}

TEST(SecondPicture, OfANameTooShortForOneIsNone) {
    EXPECT_EQ(KestPicturePaths::second(".png"), "");
    EXPECT_EQ(KestPicturePaths::second("a"), "");
    EXPECT_EQ(KestPicturePaths::second(""), "");
}

TEST(SecondPicture, OfALongPathIsAsLong) {
    std::string second = pathOfLength(300);
    second[295] = '2';
    EXPECT_EQ(KestPicturePaths::second(pathOfLength(300)), second);
}

TEST(NextPicture, CountsOn) {
    EXPECT_EQ(KestPicturePaths::next("/p/wifi_02.png"), "/p/wifi_03.png");
    EXPECT_EQ(KestPicturePaths::next("/p/wifi_09.png"), "/p/wifi_10.png");
    EXPECT_EQ(KestPicturePaths::next("/p/wifi_19.png"), "/p/wifi_20.png");
}

TEST(NextPicture, AfterNinetyNineIsTen) {
    EXPECT_EQ(KestPicturePaths::next("/p/wifi_98.png"), "/p/wifi_99.png");
    EXPECT_EQ(KestPicturePaths::next("/p/wifi_99.png"), "/p/wifi_10.png");
}

TEST(NextPicture, CountsWhatIsNoNumberAsNothing) {
    EXPECT_EQ(KestPicturePaths::next("/p/wifi_x2.png"), "/p/wifi_01.png");
    EXPECT_EQ(KestPicturePaths::next("/p/wifi.png"), "/p/wi01.png");
}

TEST(NextPicture, TakesOneDigitBehindABlankOrBeforeALetter) {
    EXPECT_EQ(KestPicturePaths::next("/p/wifi_ 7.png"), "/p/wifi_08.png");
    EXPECT_EQ(KestPicturePaths::next("/p/wifi_2a.png"), "/p/wifi_03.png");
}

TEST(NextPicture, OfANumberAndAnExtensionAlone) {
    EXPECT_EQ(KestPicturePaths::next("02.png"), "03.png");
}

TEST(NextPicture, OfANameTooShortForANumberIsNone) {
    EXPECT_EQ(KestPicturePaths::next("2.png"), "");
    EXPECT_EQ(KestPicturePaths::next(".png"), "");
    EXPECT_EQ(KestPicturePaths::next(""), "");
}

TEST(NextPicture, OfALongPathIsAsLong) {
    std::string next = pathOfLength(300);
    next[295] = '2';
    EXPECT_EQ(KestPicturePaths::next(pathOfLength(300)), next);
}

TEST(TouchPicture, HasTheMarkBeforeTheExtension) {
    EXPECT_EQ(KestPicturePaths::touch("/p/wifi_01.png"), "/p/wifi_01_touch.png");
}

TEST(TouchPicture, CutsFourCharactersOffWhateverTheExtension) {
    EXPECT_EQ(KestPicturePaths::touch("/p/wifi_01.jpeg"), "/p/wifi_01._touch.jpeg");
    EXPECT_EQ(KestPicturePaths::touch("/p/wifi_01.gz"), "/p/wifi_0_touch.gz");
}

TEST(TouchPicture, LooksForTheLastDot) {
    EXPECT_EQ(KestPicturePaths::touch("/p/wifi.new_01.png"), "/p/wifi.new_01_touch.png");
}

TEST(TouchPicture, TakesTheDotOfAFolderWhereTheNameHasNone) {
    EXPECT_EQ(KestPicturePaths::touch("/p.d/wifi_01"), "/p.d/wif_touch.d/wifi_01");
}

TEST(TouchPicture, WithoutADotIsTheCutPathAlone) {
    EXPECT_EQ(KestPicturePaths::touch("/p/wifi_01"), "/p/wif");
    EXPECT_EQ(KestPicturePaths::touch("/p/wifi"), "/p/");
}

TEST(TouchPicture, OfANameTooShortToCutIsWhatRemains) {
    EXPECT_EQ(KestPicturePaths::touch("a.b"), "_touch.b");
    EXPECT_EQ(KestPicturePaths::touch(".png"), "_touch.png");
    EXPECT_EQ(KestPicturePaths::touch("abc"), "");
    EXPECT_EQ(KestPicturePaths::touch(""), "");
}

TEST(TouchPicture, HasAtMost255Bytes) {
    const std::string whole = pathOfLength(249);
    EXPECT_EQ(KestPicturePaths::touch(whole), whole.substr(0, 245) + "_touch.png");
    const std::string oneMore = pathOfLength(250);
    EXPECT_EQ(KestPicturePaths::touch(oneMore), oneMore.substr(0, 246) + "_touch.pn");
    const std::string noExtension = pathOfLength(253);
    EXPECT_EQ(KestPicturePaths::touch(noExtension), noExtension.substr(0, 249) + "_touch");
    const std::string halfAMark = pathOfLength(256);
    EXPECT_EQ(KestPicturePaths::touch(halfAMark), halfAMark.substr(0, 252) + "_to");
}

TEST(TouchPicture, OfALongerPathIsItsBeginning) {
    for (const std::size_t length : {259U, 260U, 300U, 4000U})
        EXPECT_EQ(KestPicturePaths::touch(pathOfLength(length)), pathOfLength(length).substr(0, 255)) << length;
}

TEST(RussianPicture, HasTheMarkBeforeTheNumber) {
    EXPECT_EQ(KestPicturePaths::russian("/p/wifi_01.png"), "/p/wifi_russia_01.png");
    EXPECT_EQ(KestPicturePaths::russian("/p/wifi_12.png"), "/p/wifi_russia_12.png");
}

TEST(RussianPicture, CutsSevenCharactersOffWhateverTheNumber) {
    EXPECT_EQ(KestPicturePaths::russian("/p/wifi_1.png"), "/p/wif_russia_1.png");
    EXPECT_EQ(KestPicturePaths::russian("/p/wifi_01.jpeg"), "/p/wifi__russia_01.jpeg");
}

TEST(RussianPicture, LooksForTheLastUnderscore) {
    EXPECT_EQ(KestPicturePaths::russian("/p/wi_fi_01.png"), "/p/wi_fi_russia_01.png");
    EXPECT_EQ(KestPicturePaths::russian("/my_tips/wifi_01.png"), "/my_tips/wifi_russia_01.png");
}

TEST(RussianPicture, TakesTheUnderscoreOfAFolderWhereTheNameHasNone) {
    EXPECT_EQ(KestPicturePaths::russian("/my_tips/wifi01.png"), "/my_tips/wif_russia_tips/wifi01.png");
}

TEST(RussianPicture, WithoutAnUnderscoreIsTheCutPathAlone) {
    EXPECT_EQ(KestPicturePaths::russian("/p/wifi01.png"), "/p/wif");
    EXPECT_EQ(KestPicturePaths::russian("/p/w01.png"), "/p/");
}

TEST(RussianPicture, OfANameTooShortToCutIsWhatRemains) {
    EXPECT_EQ(KestPicturePaths::russian("_01.png"), "_russia_01.png");
    EXPECT_EQ(KestPicturePaths::russian("_1.png"), "_russia_1.png");
    EXPECT_EQ(KestPicturePaths::russian("1.png"), "");
    EXPECT_EQ(KestPicturePaths::russian(""), "");
}

TEST(RussianPicture, HasAtMost255Bytes) {
    const std::string whole = pathOfLength(248);
    EXPECT_EQ(KestPicturePaths::russian(whole), whole.substr(0, 241) + "_russia_01.png");
    const std::string oneMore = pathOfLength(249);
    EXPECT_EQ(KestPicturePaths::russian(oneMore), oneMore.substr(0, 242) + "_russia_01.pn");
    const std::string halfAMark = pathOfLength(258);
    EXPECT_EQ(KestPicturePaths::russian(halfAMark), halfAMark.substr(0, 251) + "_rus");
}

TEST(RussianPicture, OfALongerPathIsItsBeginning) {
    for (const std::size_t length : {262U, 263U, 300U, 4000U})
        EXPECT_EQ(KestPicturePaths::russian(pathOfLength(length)), pathOfLength(length).substr(0, 255)) << length;
}

class AccessiblePicture : public testing::Test {
protected:
    std::string path(const std::string& name) const { return (folder_.path() / name).string(); }
    support::TemporaryFolder folder_;
};

TEST_F(AccessiblePicture, IsAFile) {
    support::writeFile(path("a_01.png"), "");
    EXPECT_TRUE(KestPicturePaths::isAccessible(path("a_01.png")));
}

TEST_F(AccessiblePicture, MayBeALinkToAFile) {
    support::writeFile(path("a_01.png"), "");
    fs::create_symlink(path("a_01.png"), path("b_01.png"));
    EXPECT_TRUE(KestPicturePaths::isAccessible(path("b_01.png")));
}

TEST_F(AccessiblePicture, HasToBeThere) {
    EXPECT_FALSE(KestPicturePaths::isAccessible(path("a_01.png")));
    fs::create_symlink(path("a_01.png"), path("b_01.png"));
    EXPECT_FALSE(KestPicturePaths::isAccessible(path("b_01.png")));
    EXPECT_FALSE(KestPicturePaths::isAccessible(""));
}

TEST_F(AccessiblePicture, IsNoFolder) {
    EXPECT_FALSE(KestPicturePaths::isAccessible(folder_.path()));
    EXPECT_FALSE(KestPicturePaths::isAccessible(path("")));
}

TEST_F(AccessiblePicture, IsNothingThatWaitsForAWriter) {
    ASSERT_EQ(mkfifo(path("a_01.png").c_str(), 0600), 0);
    EXPECT_FALSE(KestPicturePaths::isAccessible(path("a_01.png")));
}
