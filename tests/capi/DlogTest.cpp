#include "dlog.h"

#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using support::TemporaryDevice;
using testing::ElementsAre;

TEST(Dlog, WritesALineWithItsLevelAndTag) {
    const TemporaryDevice device;
    EXPECT_EQ(dlog_print(DLOG_DEBUG, "TEA", "%s: %s(%d) > %s", "Tea.cpp", "brew", 42, "ready"), 25);
    dlog_print(DLOG_INFO, "TEA", "info");
    dlog_print(DLOG_WARN, "TEA", "warning");
    dlog_print(DLOG_ERROR, "TEA", "error");
    dlog_print(DLOG_FATAL, "TEA", "fatal");
    EXPECT_THAT(device.logMessages(), ElementsAre("D TEA Tea.cpp: brew(42) > ready", "I TEA info", "W TEA warning",
                                                  "E TEA error", "F TEA fatal"));
}

TEST(Dlog, KeepsALongMessageWhole) {
    const TemporaryDevice device;
    for (const int length : {510, 511, 512, 513, 100000}) {
        const std::string message(static_cast<std::size_t>(length), 'x');
        EXPECT_EQ(dlog_print(DLOG_INFO, "TEA", "%s", message.c_str()), length);
        EXPECT_EQ(device.logMessages().back(), "I TEA " + message);
    }
}

TEST(Dlog, TakesALowerLevelForTheLowest) {
    const TemporaryDevice device;
    dlog_print(static_cast<log_priority>(0), "TEA", "low");
    EXPECT_THAT(device.logMessages(), ElementsAre("D TEA low"));
}

TEST(Dlog, SaysThatALineCouldNotBeWritten) {
    const TemporaryDevice device;
    std::filesystem::create_directory(device.root() / "device.log");
    EXPECT_EQ(dlog_print(DLOG_INFO, "TEA", "message"), -1);
}

TEST(Dlog, BearsNull) {
    const TemporaryDevice device;
    EXPECT_EQ(dlog_print(DLOG_INFO, nullptr, "message"), 7);
    // Compilers check formats where they see the function's name.
    const auto print = &dlog_print;
    EXPECT_EQ(print(DLOG_INFO, "TEA", nullptr), -1);
    EXPECT_THAT(device.logMessages(), ElementsAre("I  message"));
}

}  // namespace
