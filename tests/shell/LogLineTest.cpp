#include "KestLog.h"

#include "kest/KestDevice.h"

#include <gmock/gmock.h>

using testing::ElementsAre;

class LogLine : public testing::Test, protected KestDevice {};

TEST_F(LogLine, SaysFileFunctionAndLine) {
    KEST_INFO("%d of %s", 1, "two");
    const int line = __LINE__ - 1;
    EXPECT_THAT(device().logMessages(),
                ElementsAre("I KEST LogLineTest.cpp: TestBody(" + std::to_string(line) + ") > 1 of two"));
}

TEST_F(LogLine, HasTheColourOfItsLevel) {
    KEST_BEGIN();
    KEST_HIT();
    KEST_WARN("%s", "warned");
    KEST_ERR("%s", "failed");
    const int line = __LINE__ - 4;
    const auto head = [&](int number) { return " KEST LogLineTest.cpp: TestBody(" + std::to_string(number) + ") > "; };
    EXPECT_THAT(device().logMessages(), ElementsAre("I" + head(line) + "\x1b[0;32mBEGIN >>>>\x1b[0;m",
                                                    "I" + head(line + 1) + "\x1b[0;34m>>>HIT<<<\x1b[0;m",
                                                    "W" + head(line + 2) + "\x1b[0;35mwarned\x1b[0;m",
                                                    "E" + head(line + 3) + "\x1b[0;31m* Critical * failed\x1b[0;m"));
}
