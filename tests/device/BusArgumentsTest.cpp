#include "device/BusArguments.h"

#include <gtest/gtest.h>

namespace {

using device::faultOfArguments;

TEST(TheArgumentsOfACall, AreThoseThatTheMethodTakes) {
    EXPECT_EQ(faultOfArguments({}, ""), "");
    EXPECT_EQ(faultOfArguments({{"uris", "as"}, {"data", "a{sv}"}}, "asa{sv}"), "");
}

TEST(TheArgumentsOfACall, AreNamedWhereTheyAreOthers) {
    EXPECT_EQ(faultOfArguments({{"extras", "a{ss}"}}, "s"), "the argument \"extras\" has the type s; it must be a{ss}");
    EXPECT_EQ(faultOfArguments({{"uris", "as"}, {"data", "a{sv}"}}, "asa{ss}"),
              "the argument \"data\" has the type a{ss}; it must be a{sv}");
    EXPECT_EQ(faultOfArguments({{"x", "i"}, {"y", "i"}}, "(ii)"), "the argument \"x\" has the type (ii); it must be i");
}

TEST(TheArgumentsOfACall, AreNamedWhereTheyAreMissing) {
    EXPECT_EQ(faultOfArguments({{"extras", "a{ss}"}}, ""), "the argument \"extras\", of the type a{ss}, is missing");
    EXPECT_EQ(faultOfArguments({{"uris", "as"}, {"data", "a{sv}"}}, "as"),
              "the argument \"data\", of the type a{sv}, is missing");
}

TEST(TheArgumentsOfACall, AreNotMoreThanTheMethodTakes) {
    EXPECT_EQ(faultOfArguments({}, "s"), "the call has an argument too many, of the type s; the method takes none");
    EXPECT_EQ(faultOfArguments({{"extras", "a{ss}"}}, "a{ss}(sv)i"),
              "the call has an argument too many, of the type (sv) behind \"extras\"");
}

}  // namespace
