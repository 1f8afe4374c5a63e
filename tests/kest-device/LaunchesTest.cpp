#include "ToolTest.h"

#include "device/Launches.h"

using device::LaunchOutcome;
using testing::MatchesRegex;

namespace {

class Launches : public ToolTest {
protected:
    static constexpr char app[] = "com.example.app";
    static constexpr char tea[] = "com.example.tea";
};

}  // namespace

TEST_F(Launches, AreNoneAtFirst) {
    EXPECT_EQ(run({"launches"}), done());
    EXPECT_EQ(run({"launches", "--json"}), done("[]\n"));
}

TEST_F(Launches, AreListedTheNewestLast) {
    {
        device::Device device = device_.open();
        device.launches().append({app, tea, {{"cup", "2"}, {"page", "walk"}}}, LaunchOutcome::Started);
        device.launches().append({app, tea, {}}, LaunchOutcome::HandedOver);
        device.launches().append({app, "com.example.none", {}}, LaunchOutcome::Failed, "it is not installed");
        device.launches().append({app, "", {}}, LaunchOutcome::Asked);
    }

    const std::string time = "[0-9-]+T[0-9:]+\\.[0-9][0-9][0-9]Z";
    EXPECT_THAT(device_.must({"launches"}),
                MatchesRegex("1  " + time + "  com.example.app  com.example.tea   cup=2 page=walk  started\n" +  //
                             "2  " + time + "  com.example.app  com.example.tea   -                handed over\n" +
                             "3  " + time +
                             "  com.example.app  com.example.none  -                failed: it is not installed\n" +
                             "4  " + time + "  com.example.app  -                 -                asked\n"));
}

TEST_F(Launches, AreGivenAsJson) {
    device_.open().launches().append({app, tea, {{"cup", "2"}}}, LaunchOutcome::Failed, "it ended with status 3");

    nlohmann::json launch = device_.json({"launches"})[0];

    EXPECT_THAT(launch["time"].get<std::string>(), MatchesRegex("[0-9-]+T[0-9:]+\\.[0-9][0-9][0-9]Z"));
    launch.erase("time");
    EXPECT_EQ(launch, nlohmann::json({{"id", 1},
                                      {"caller", app},
                                      {"application", tea},
                                      {"extras", {{"cup", "2"}}},
                                      {"outcome", "failed"},
                                      {"reason", "it ended with status 3"}}));
}

TEST_F(Launches, KeepToTheirLineWhateverTheyHold) {
    const std::string strange = "a\nb\x1b[31m";
    device_.open().launches().append({app, strange, {{strange, strange}}}, LaunchOutcome::Failed, strange);

    EXPECT_THAT(device_.must({"launches"}),
                testing::EndsWith("  com.example.app  a\\nb\\x1b[31m  a\\nb\\x1b[31m=a\\nb\\x1b[31m  failed: "
                                  "a\\nb\\x1b[31m\n"));
}

TEST_F(Launches, ThatAreNoUtf8AreGivenAsJsonNevertheless) {
    device_.open().launches().append({app, "caf\xe9", {}}, LaunchOutcome::Failed, "");

    EXPECT_EQ(device_.json({"launches"})[0]["application"], "caf\xEF\xBF\xBD");
}
