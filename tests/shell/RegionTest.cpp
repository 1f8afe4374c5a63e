#include "KestCommon.h"

#include "kest/KestDevice.h"

#include <device/Keys.h>

#include <gtest/gtest.h>

#include <ostream>

namespace {

struct Country {
    std::string code;
    std::string region;
};

std::ostream& operator<<(std::ostream& stream, const Country& country) {
    return stream << '"' << country.code << "\" is in " << country.region;
}

class Region : public testing::TestWithParam<Country>, protected KestDevice {};

TEST_P(Region, FollowsTheCountry) {
    device()->settings().set(device::keys::country, GetParam().code);
    EXPECT_EQ(KestCommon::getRegion(), GetParam().region);
}

INSTANTIATE_TEST_SUITE_P(Of, Region,
                         testing::Values(Country{"IN", "India"}, Country{"RU", "Russia"}, Country{"ID", "Indonesia"},
                                         Country{"BD", "SWA"}, Country{"LK", "SWA"}, Country{"NP", "SWA"},
                                         Country{"ZA", "Africa"}, Country{"KE", "Africa"}, Country{"NG", "Africa"},
                                         Country{"KR", "Global"}, Country{"US", "Global"}, Country{"in", "Global"},
                                         Country{"", "Global"}, Country{"IND", "Global"}, Country{"I", "Global"},
                                         Country{" IN", "Global"}, Country{"Global", "Global"}, Country{"ru", "Global"},
                                         Country{"RUS", "Global"}, Country{"R", "Global"}, Country{"id", "Global"},
                                         Country{"IDN", "Global"}, Country{"bd", "Global"}, Country{"BGD", "Global"},
                                         Country{"B", "Global"}, Country{"lk", "Global"}, Country{"LKA", "Global"},
                                         Country{"np", "Global"}, Country{"NPL", "Global"}, Country{"za", "Global"},
                                         Country{"ZAF", "Global"}, Country{"ke", "Global"}, Country{"KEN", "Global"},
                                         Country{"ng", "Global"}, Country{"NGA", "Global"}));

class RegionOfNoCountry : public testing::Test, protected KestDevice {};

TEST_F(RegionOfNoCountry, IsGlobal) {
    ASSERT_EQ(device()->settings().get(device::keys::country), std::nullopt);
    EXPECT_EQ(KestCommon::getRegion(), "Global");
}

TEST_F(RegionOfNoCountry, IsGlobalWhenItCannotBeRead) {
    device()->settings().set(device::keys::country, "IN");
    device::faults::plan("vconf_get_str", -1);
    EXPECT_EQ(KestCommon::getRegion(), "Global");
    EXPECT_EQ(KestCommon::getRegion(), "India");
}

}  // namespace
