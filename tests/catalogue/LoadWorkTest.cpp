#include "KestLoadWork.h"

#include "ProcessorClock.h"

#include <gtest/gtest.h>

namespace {

constexpr std::uint64_t gibibyte = std::uint64_t{1} << 30;
/// More than one text costs beside its bytes.
constexpr std::uint64_t some = 1 << 20;

TEST(LoadWork, OfOneDetailIsAGibibyteOfText) {
    KestLoadWork work;
    EXPECT_TRUE(work.spendOnText(gibibyte - some));
    EXPECT_FALSE(work.spendOnText(some));
    EXPECT_FALSE(work.spendOnText(0)) << "who asks for too much gets nothing more";
    work.beginDetail();
    EXPECT_TRUE(work.spendOnText(gibibyte - some)) << "another detail does";
}

TEST(LoadWork, OfTranslatingIsMoreThanOfMoving) {
    EXPECT_EQ(KestLoadWork::ofTranslating(1600), 51200U);
    EXPECT_EQ(KestLoadWork::ofMoving(1600), 100U);
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

TEST(LoadWork, KeepsSixtyFourMebibytes) {
    KestLoadWork work;
    EXPECT_TRUE(work.spendOnKeeping(gibibyte / 16 - 1));
    EXPECT_TRUE(work.keepsMore());
    EXPECT_FALSE(work.spendOnKeeping(2));
    EXPECT_FALSE(work.keepsMore());
    EXPECT_FALSE(work.spendOnKeeping(1));
}

TEST(LoadWork, OnFilesIsAQuarterOfAGibibyte) {
    KestLoadWork work;
    EXPECT_TRUE(work.spendOnFile(gibibyte / 4));
    work.beginDetail();
    EXPECT_FALSE(work.spendOnFile(1));
}

TEST(LoadWork, EndsAfterTenSecondsOfTheProcessorsTime) {
    KestLoadWork work;
    processor_clock::ahead = 9;
    EXPECT_TRUE(work.spendOnText(0));
    processor_clock::ahead = 11;
    work.beginDetail();
    EXPECT_FALSE(work.spendOnText(0));
    EXPECT_FALSE(work.spendOnFile(0));
    EXPECT_FALSE(work.spendOnKeeping(0));
    KestLoadWork next;
    EXPECT_TRUE(next.spendOnText(0)) << "another load has its own";
    processor_clock::ahead = 0;
}

/// How many texts, or files, of no length are taken once the time is over: the clock is not looked at for each.
template <class Spend>
int takenTooLate(Spend spend) {
    KestLoadWork work;
    processor_clock::ahead = 11;
    int taken = 0;
    while (taken < 1000 && (work.*spend)(0))
        ++taken;
    processor_clock::ahead = 0;
    return taken;
}

TEST(LoadWork, OfOneDetailEndsByTheClockToo) {
    EXPECT_LT(takenTooLate(&KestLoadWork::spendOnText), 32);
}

TEST(LoadWork, OnManyEmptyFilesEndsByTheClock) {
    EXPECT_LT(takenTooLate(&KestLoadWork::spendOnFile), 32);
}

}  // namespace
