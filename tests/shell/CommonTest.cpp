#include "KestCommon.h"

#include <gtest/gtest.h>

#include <type_traits>

TEST(Common, HasAVirtualDestructorAndNoState) {
    EXPECT_TRUE(std::has_virtual_destructor_v<KestCommon>);
    EXPECT_EQ(sizeof(KestCommon), sizeof(void*));
}
