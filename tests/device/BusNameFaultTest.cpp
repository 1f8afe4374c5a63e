#include "device/BusName.h"

#include <gtest/gtest.h>

namespace {

std::string faultOf(const std::string& name) {
    return device::BusName::faultOf(name);
}

TEST(ANameOnTheBus, HasNoFaultWhereItIsValid) {
    for (const char* name : {"com.example", "com.example.app", "a.b-c_D9"})
        EXPECT_EQ(faultOf(name), "") << name;
    EXPECT_EQ(faultOf("a." + std::string(253, 'b')), "");
}

TEST(ANameOnTheBus, HasPartsThatSaySomething) {
    EXPECT_EQ(faultOf("com..app"), "part 2 of it is empty");
    EXPECT_EQ(faultOf(".com.app"), "part 1 of it is empty");
    EXPECT_EQ(faultOf("com.app."), "part 3 of it is empty");
    EXPECT_EQ(faultOf("."), "part 1 of it is empty");
    EXPECT_EQ(faultOf(""), "it is empty");
    EXPECT_EQ(faultOf("app"), "it has no dot; it needs two or more parts, joined by dots");
    EXPECT_EQ(faultOf("a." + std::string(254, 'b')), "it is longer than 255 characters");
}

TEST(ANameOnTheBus, HasPartsOfLettersDigitsAndTwoSigns) {
    const std::string allowed = "; only letters, digits, \"-\" and \"_\" may stand there";
    EXPECT_EQ(faultOf("1com.app"), "part 1 of it, \"1com\", begins with a digit");
    EXPECT_EQ(faultOf("com.7up"), "part 2 of it, \"7up\", begins with a digit");
    EXPECT_EQ(faultOf("com.my app"), "part 2 of it, \"my app\", holds \" \"" + allowed);
    EXPECT_EQ(faultOf("com.\xC3\xA4pp.x"), "part 2 of it, \"\xC3\xA4pp\", holds \"\xC3\xA4\"" + allowed);
    EXPECT_EQ(faultOf(":1.5"), "part 1 of it, \":1\", holds \":\"" + allowed);
    EXPECT_EQ(faultOf("com.a\nb"), "part 2 of it, \"a b\", holds a control character" + allowed);
    EXPECT_EQ(faultOf(std::string("com.a\0b", 7)), "part 2 of it, \"a b\", holds a control character" + allowed);
    EXPECT_EQ(faultOf("../app"), "part 1 of it is empty");
}

}  // namespace
