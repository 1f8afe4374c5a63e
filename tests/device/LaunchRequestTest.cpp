#include "device/LaunchRequest.h"

#include "device/OneLine.h"

#include <gtest/gtest.h>

namespace {

using device::Extras;

std::string faultOf(const Extras& extras) {
    return device::faultOf({"", "com.example.tea", extras});
}

TEST(ALaunchRequest, CarriesTextsUnderNamesOfTheirOwn) {
    EXPECT_EQ(faultOf({}), "");
    EXPECT_EQ(faultOf({{"a", ""}, {"b", "x=y\n\"$(z)\""}, {"c d", "\xC3\xA4"}}), "");
    EXPECT_EQ(faultOf({{"", "x"}}), "an extra of the launch request has no name; give each one");
    EXPECT_EQ(faultOf({{"a=b", "c"}}), "the extra \"a=b\" has a \"=\" in its name");
    EXPECT_EQ(faultOf({{"a", "\xff"}}), "the extra \"a\" is not UTF-8");
    EXPECT_EQ(faultOf({{"page", "1"}, {"cup", "1"}, {"page", "1"}}), "the extra \"page\" is given twice");
}

TEST(ALaunchRequest, IsNotLargerThan64KiBInAll) {
    const std::size_t most = 64 * 1024 - std::string("com.example.tea").size() - 8 - 1;
    EXPECT_EQ(faultOf({{"a", std::string(most, 'x')}}), "");
    EXPECT_EQ(faultOf({{"a", std::string(most + 1, 'x')}}), "the request is larger than 64 KiB");
}

TEST(ALaunchRequest, IsFaultedOnOneLine) {
    EXPECT_EQ(faultOf({{"a\nb=", ""}}), "the extra \"a b=\" has a \"=\" in its name");
    EXPECT_EQ(faultOf({{std::string(1000, 'a') + "=", ""}}),
              "the extra \"" + std::string(100, 'a') + "...\" has a \"=\" in its name");
}

TEST(OneLine, EndsAfterAWholeCharacter) {
    EXPECT_EQ(device::oneLine("abc", 3), "abc");
    EXPECT_EQ(device::oneLine("abcd", 3), "abc...");
    EXPECT_EQ(device::oneLine("ab\xC3\xA4", 3), "ab...");
    EXPECT_EQ(device::oneLine("a\xC3\xA4z", 3), "a\xC3\xA4...");
    EXPECT_EQ(device::oneLine("a\tb\x7f\r\n", 10), "a b   ");
}

}  // namespace
