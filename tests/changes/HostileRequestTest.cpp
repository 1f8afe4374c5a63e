#include "ChangesTest.h"

#include <ostream>

using testing::IsEmpty;

namespace {

const std::string megabyte(1 << 20, 'x');
const std::string notUtf8 = "\xff\xfe\x80";

/// Extras that nobody in his senses sends, and what they come to while the list is shown.
struct Hostile {
    std::string name;
    std::vector<std::pair<std::string, std::string>> extras;
    std::string top = "list Tips: Tips and guidelines";
    std::vector<std::string> records = {};

    friend void PrintTo(const Hostile& request, std::ostream* stream) { *stream << request.name; }
};

Hostile alarmAtPage(const std::string& name, const std::string& page) {
    return {name, {{"appID", "com.example.alarm"}, {"page", page}}};
}
/// Every tip of the application is opened, one after the other.
Hostile opensAll(const std::string& name, const std::string& page) {
    Hostile request = alarmAtPage(name, page);
    request.top = "page Tips 3/10: Snooze, How to use Snooze";
    request.records = {"KT03 Alarm", "KT03 Snooze"};
    return request;
}
Hostile opensTheSecond(const std::string& name, const std::string& page) {
    Hostile request = opensAll(name, page);
    request.records = {"KT03 Snooze"};
    return request;
}

}  // namespace

class HostileRequest : public ChangesTest, public testing::WithParamInterface<Hostile> {
public:
    static std::string nameOf(const testing::TestParamInfo<Hostile>& request) { return request.param.name; }
};

INSTANTIATE_TEST_SUITE_P(
    With, HostileRequest,
    testing::Values(
        Hostile{"AnEmptyApplication", {{"appID", ""}}}, Hostile{"AnApplicationOfAMegabyte", {{"appID", megabyte}}},
        Hostile{"AnApplicationThatIsNotUtf8", {{"appID", notUtf8}}},
        Hostile{"AnApplicationThatIsAFormat", {{"appID", "%s%s%n%100000d"}}},
        Hostile{"AnApplicationOfTwoLines", {{"appID", "com.example.alarm\ncom.example.alarm"}}},
        Hostile{"AnApplicationInCapitals", {{"appID", "COM.EXAMPLE.ALARM"}}},
        Hostile{"ATypeOfAMegabyte", {{"LaunchingType", megabyte}}},
        Hostile{"ATypeThatIsNotUtf8", {{"LaunchingType", notUtf8}}}, Hostile{"AnEmptyType", {{"LaunchingType", ""}}},
        Hostile{"ATypeThatBeginsAsTheOneThereIs", {{"LaunchingType", "addNoti2"}}},
        Hostile{"AThousandExtras", std::vector<std::pair<std::string, std::string>>(1000, {"more", "x"})},
        Hostile{"APageButNoApplication", {{"page", "2"}}},
        alarmAtPage("APageBeyondEveryNumber", "99999999999999999999"), alarmAtPage("APageBeyondTheMatches", "3"),
        opensAll("APageBelowEveryNumber", "-99999999999999999999"), opensAll("ANegativePage", "-1"),
        opensAll("PageNought", "0"), opensAll("AnEmptyPage", ""), opensAll("APageOfAMegabyte", megabyte),
        opensAll("APageThatIsNotUtf8", notUtf8), opensAll("AHexadecimalPage", "0x2"),
        opensTheSecond("ANumberAmongOtherThings", " 2x"), opensTheSecond("AFraction", "2.9"),
        opensTheSecond("ASign", "+2")),
    HostileRequest::nameOf);

TEST_P(HostileRequest, ComesToNoHarm) {
    begin();
    request(GetParam().extras);
    test_ui::runFor(1);
    EXPECT_EQ(top(), GetParam().top);
    EXPECT_EQ(newRecords(), GetParam().records);
    request({{"appID", "com.example.music"}});
    test_ui::runFor(0.35);
    EXPECT_EQ(top(), "page Tips 4/10: Music, How to use Music");
    back();
    test_ui::runFor(0.7);
    EXPECT_EQ(top(), "list Tips: Tips and guidelines");
    EXPECT_THAT(newErrors(), IsEmpty());
}

using FirstRequest = ChangesTest;

TEST_F(FirstRequest, WithHostileExtrasShowsNothingAndLeavesTheNextOneAlone) {
    begin({"appID=" + std::string(50000, 'x'), "page=99999999999999999999", "LaunchingType=%s%n"});
    EXPECT_EQ(top(), "nothing");
    request({{"appID", "com.example.music"}});
    test_ui::runFor(1);
    EXPECT_EQ(top(), "page Tips 4/10: Music, How to use Music");
    EXPECT_THAT(newErrors(), IsEmpty());
}
