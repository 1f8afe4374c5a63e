#include "KestLoadWork.h"

#include <gtest/gtest.h>

namespace {

constexpr std::uint64_t gibibyte = std::uint64_t{1} << 30;
/// More than one text costs beside its bytes.
constexpr std::uint64_t some = 1 << 20;

TEST(LoadWork, OfOneDetailIsAGibibyteOfText) {
    KestLoadWork work;
    EXPECT_TRUE(work.spendOnText(gibibyte - some));
    EXPECT_FALSE(work.spendOnText(some));
    EXPECT_TRUE(work.spendOnText(0)) << "what was refused has cost nothing";
}

TEST(LoadWork, OfAllDetailsIsFourGibibytesOfText) {
    KestLoadWork work;
    for (int detail = 0; detail < 4; ++detail) {
        work.beginDetail();
        EXPECT_TRUE(work.spendOnText(gibibyte - some)) << detail;
    }
    work.beginDetail();
    EXPECT_FALSE(work.spendOnText(gibibyte / 2));
}

TEST(LoadWork, OfShortTextsEndsToo) {
    KestLoadWork work;
    int texts = 0;
    while (texts < 1000000 && work.spendOnText(0))
        ++texts;
    EXPECT_EQ(texts, 262144);
}

TEST(LoadWork, OnFilesIsAQuarterOfAGibibyte) {
    KestLoadWork work;
    EXPECT_TRUE(work.spendOnFile(gibibyte / 4));
    work.beginDetail();
    EXPECT_FALSE(work.spendOnFile(1));
}

}  // namespace
