#include "device/BusName.h"

#include "SilentConnection.h"
#include "support/Message.h"
#include "support/PrivateBus.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using device::Bus;
using device::BusName;
using device::Folder;
using support::messageOf;
using support::PrivateBus;
using support::runLoopUntil;
using support::TemporaryFolder;

/// Two connections of this process to one bus.
class BusNames : public testing::Test {
protected:
    PrivateBus daemon;
    TemporaryFolder folder;
    std::unique_ptr<Bus> first = connectSilently(Folder(folder.path()));
    std::unique_ptr<Bus> second = connectSilently(Folder(folder.path()));
};

TEST_F(BusNames, BelongToTheFirstWhoAsks) {
    EXPECT_EQ(BusName::owner(*first, "com.example.app"), std::nullopt);
    EXPECT_EQ(BusName::processOf(*first, "com.example.app"), std::nullopt);
    EXPECT_EQ(BusName::own(*first, "com.example.app", false), BusName::Result::Owner);
    EXPECT_EQ(BusName::own(*first, "com.example.app", false), BusName::Result::Owner);
    EXPECT_EQ(BusName::own(*second, "com.example.app", false), BusName::Result::Taken);
    EXPECT_EQ(BusName::owner(*second, "com.example.app"), eldbus_connection_unique_name_get(first->connection()));
    EXPECT_EQ(BusName::processOf(*second, "com.example.app"), getpid());
}

TEST_F(BusNames, PassToWhoeverIsNextInLineWhenTheirOwnerEnds) {
    EXPECT_EQ(BusName::own(*first, "com.example.app", true), BusName::Result::Owner);
    EXPECT_EQ(BusName::own(*second, "com.example.app", true), BusName::Result::Queued);
    const std::string next = eldbus_connection_unique_name_get(second->connection());
    first.reset();
    EXPECT_TRUE(runLoopUntil([&] { return BusName::owner(*second, "com.example.app") == next; }));
}

TEST_F(BusNames, AreFreeAfterTheirRelease) {
    BusName::own(*first, "com.example.app", false);
    BusName::release(*first, "com.example.app");
    EXPECT_EQ(BusName::own(*second, "com.example.app", false), BusName::Result::Owner);
}

TEST_F(BusNames, AreListedInAlphabeticalOrder) {
    BusName::own(*first, "com.example.b", false);
    BusName::own(*second, "com.example.a", false);
    EXPECT_THAT(BusName::all(*first), testing::ElementsAre("com.example.a", "com.example.b", "org.freedesktop.DBus"));
}

TEST_F(BusNames, ThatAreNoneAreRefused) {
    for (const char* name : {"", "single", ":1.5", "com..app", "com.7up", "com.exa mple", "com.ex\xc3\xa4mple", "../x"})
        EXPECT_EQ(messageOf([&] { BusName::own(*first, name, false); }),
                  "\"" + std::string(name) +
                      "\" is no name of an application; it needs two or more words of letters, digits, '-' and '_', "
                      "joined by dots");
    EXPECT_FALSE(BusName::isValid("com." + std::string(300, 'x')));
    EXPECT_TRUE(BusName::isValid("com.example.my-app_2"));
}

}  // namespace
