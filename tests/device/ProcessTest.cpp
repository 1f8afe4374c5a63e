#include "device/Process.h"

#include "support/Message.h"

#include <gtest/gtest.h>

TEST(Process, ThatCannotBeSeenFromHereIsNotEndedFromHere) {
    // These ids would mean a group of processes: this one's, or all.
    for (const int id : {0, -1})
        EXPECT_EQ(support::messageOf([&] { device::Process(id).end(); }),
                  "a process that cannot be seen from here, for example in a container, has to be ended there");
}
