#include "ProgramTest.h"

using testing::HasSubstr;
using testing::Not;

namespace {

/// Two applications on one device.
class Several : public ProgramTest {
protected:
    static constexpr char sample[] = "com.example.sample";

    void SetUp() override {
        device_.must({"install", SAMPLE_PACKAGE});
        start();
        device_.must({"start", "--headless", "--", sample});
    }
};

}  // namespace

TEST_F(Several, AreToldByTheStatus) {
    const nlohmann::json applications = device_.json({"status"})["applications"];
    ASSERT_EQ(applications.size(), 2U);
    EXPECT_EQ(applications[0]["id"], sample);
    EXPECT_EQ(applications[1]["id"], app);
}

TEST_F(Several, AreDrivenByTheirNames) {
    EXPECT_THAT(device_.must({"tree", "--app", sample}), HasSubstr("Fruits"));
    EXPECT_THAT(device_.must({"tree", "--app", app}), HasSubstr("Tips and guidelines"));
    device_.must({"tap", "--text", "Apple", "--app", sample});
    EXPECT_THAT(device_.must({"tree", "--app", sample}), HasSubstr("PageView"));
    EXPECT_THAT(device_.must({"tree", "--app", app}), Not(HasSubstr("PageView")));
}

TEST_F(Several, BothFollowASetting) {
    device_.must({"set", "language", "ko_KR"});
    EXPECT_THAT(device_.must({"tree", "--app", sample}), HasSubstr("Fruits ko_KR"));
    EXPECT_THAT(device_.must({"tree", "--app", app}), Not(HasSubstr("Tips and guidelines")));
}
