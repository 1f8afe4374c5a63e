#include "KestPictureFile.h"

#include "support/TemporaryFolder.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>

namespace {

std::string chunk(const std::string& name, const std::string& contents, std::uint32_t length) {
    std::string bytes;
    for (int shift = 24; shift >= 0; shift -= 8)
        bytes += static_cast<char>(length >> shift & 0xff);
    return bytes + name + contents + "csum";
}
std::string chunk(const std::string& name, const std::string& contents) {
    return chunk(name, contents, static_cast<std::uint32_t>(contents.size()));
}

/// The bytes of a PNG, as far as its chunks go.
class PictureFile : public testing::Test {
protected:
    const std::string head_ = "\x89PNG\r\n\x1a\n" + chunk("IHDR", "thirteenbytes");
    const std::string end_ = chunk("IEND", "");
    const std::string picture_ = head_ + chunk("IDAT", std::string(300, 'p')) + chunk("IDAT", "p") + end_;

    bool isWhole(const std::string& bytes) const {
        const std::string path = (folder_.path() / "picture.png").string();
        support::writeFile(path, bytes);
        return KestPictureFile::isWhole(path);
    }

    support::TemporaryFolder folder_;
};

}  // namespace

TEST_F(PictureFile, IsWholeWithItsLastChunk) {
    EXPECT_TRUE(isWhole(picture_));
}

TEST_F(PictureFile, IsNotWholeWhereverItBreaksOff) {
    for (std::size_t length = 8; length < picture_.size(); ++length)
        EXPECT_FALSE(isWhole(picture_.substr(0, length))) << length;
}

TEST_F(PictureFile, IsWholeHoweverMuchIsAppended) {
    EXPECT_TRUE(isWhole(picture_ + std::string(100'000, 'x')));
}

TEST_F(PictureFile, IsNotWholeByALastChunkThatStandsWithinAnother) {
    EXPECT_FALSE(isWhole(head_ + chunk("IDAT", end_ + end_, 300)));
}

TEST_F(PictureFile, IsNotWholeWithAChunkLongerThanAnyFile) {
    EXPECT_FALSE(isWhole(head_ + chunk("IDAT", "p", 0xffffffff) + end_));
}

TEST_F(PictureFile, IsNotWholeWithoutAnEndToItsChunks) {
    std::string bytes = head_;
    for (int i = 0; i < 70'000; ++i)
        bytes += chunk("none", "");
    EXPECT_FALSE(isWhole(bytes + end_));
}

TEST_F(PictureFile, OfAnotherKindCountsAsWhole) {
    EXPECT_TRUE(isWhole(""));
    EXPECT_TRUE(isWhole("\x89PNG"));
    EXPECT_TRUE(isWhole("a text of some length"));
    EXPECT_TRUE(KestPictureFile::isWhole((folder_.path() / "none.png").string()));
}
