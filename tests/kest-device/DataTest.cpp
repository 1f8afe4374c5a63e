#include "ToolTest.h"

namespace {

class Packages : public ToolTest {
protected:
    std::string made(const std::string& version = "1.0") {
        return test_tool::makePackage(device_.folder() / "game", "com.example.game", version).string();
    }
    nlohmann::json listed(const std::string& id) {
        for (const nlohmann::json& package : device_.json({"packages"})) {
            if (package["id"] == id) {
                return package;
            }
        }
        return nullptr;
    }
};

class Preferences : public ToolTest {};
class UsageRecords : public ToolTest {};

}  // namespace

TEST_F(Packages, AreInstalledUpdatedAndRemoved) {
    const std::string source = made();
    EXPECT_EQ(run({"install", source}), done("installed com.example.game 1.0\n"));
    EXPECT_EQ(run({"install", made("1.1")}), done("updated com.example.game 1.1\n"));

    EXPECT_EQ(listed("com.example.game"), nlohmann::json({{"id", "com.example.game"},
                                                          {"version", "1.1"},
                                                          {"label", "Label of com.example.game"},
                                                          {"preinstalled", false},
                                                          {"icon", ""},
                                                          {"root", root() + "/opt/usr/apps/com.example.game"}}));

    EXPECT_EQ(run({"uninstall", "com.example.game"}), done("uninstalled com.example.game\n"));
    EXPECT_EQ(listed("com.example.game"), nullptr);
}

TEST_F(Packages, AreListedForPeople) {
    device_.must({"install", made()});

    EXPECT_THAT(run({"packages"}).out,
                testing::ContainsRegex("com\\.example\\.game +1\\.0 +installed +Label of com\\.example\\.game\n"));
    EXPECT_THAT(run({"packages"}).out, testing::ContainsRegex("com\\.ravella\\.kest +[0-9.]+ +preinstalled +Tips\n"));
}

TEST_F(Packages, ARelativeFolderIsTakenFromWhereThePersonIs) {
    made();

    EXPECT_EQ(run({"install", "game"}), done("installed com.example.game 1.0\n"));
}

TEST_F(Packages, AFolderWithoutAManifestIsRefused) {
    const std::string folder = device_.folder() / "home";

    const Result result = run({"install", folder});

    EXPECT_EQ(result.status, 1);
    EXPECT_THAT(result.err, testing::StartsWith("kest-device: error: " + folder + "/tizen-manifest.xml: "));
    EXPECT_EQ(std::count(result.err.begin(), result.err.end(), '\n'), 1);
}

TEST_F(Packages, AnUnknownOneCannotBeRemoved) {
    EXPECT_EQ(run({"uninstall", "com.example.none"}),
              failed("\"com.example.none\" is not installed; see the device's list of packages"));
}

TEST_F(Packages, AResetBringsBackWhatEveryDeviceHas) {
    device_.must({"install", made()});
    device_.must({"uninstall", "com.ravella.kest"});
    ASSERT_EQ(listed("com.ravella.kest"), nullptr);

    device_.must({"reset"});

    EXPECT_NE(listed("com.ravella.kest"), nullptr);
    EXPECT_EQ(listed("com.example.game"), nullptr);
}

TEST_F(Preferences, AreListedByApplication) {
    device_.open().preferences().set("com.example.one", "greeting", "Hello\nworld");
    device_.open().preferences().set("com.example.two", "n", "2");

    EXPECT_EQ(run({"preferences"}), done("com.example.one  greeting  Hello\\nworld\ncom.example.two  n         2\n"));
    EXPECT_EQ(run({"preferences", "com.example.two"}), done("com.example.two  n  2\n"));
    EXPECT_EQ(device_.json({"preferences", "com.example.one"}),
              nlohmann::json({{"com.example.one", {{"greeting", "Hello\nworld"}}}}));
}

TEST_F(Preferences, AreClearedForOneApplication) {
    device_.open().preferences().set("com.example.one", "key", "1");
    device_.open().preferences().set("com.example.two", "key", "2");

    EXPECT_EQ(run({"clear", "com.example.one"}), done());

    EXPECT_EQ(run({"preferences"}), done("com.example.two  key  2\n"));
}

TEST_F(Preferences, OfAnUnknownApplicationAreAnError) {
    const Result unknown = failed("com.example.none is not installed and has stored nothing; 'kest-device packages' "
                                  "lists what is");
    EXPECT_EQ(run({"clear", "com.example.none"}), unknown);
    EXPECT_EQ(run({"preferences", "com.example.none"}), unknown);
}

TEST_F(UsageRecords, AreListedInTheirOrder) {
    device_.open().usage().append("content://log", {{"app_id", "com.example.one"}, {"feature", "AB01"}});
    device_.open().usage().append("content://log", {{"extra", "two\nlines"}});
    const std::vector<device::UsageRecord> records = device_.open().usage().all();

    EXPECT_EQ(run({"usage"}),
              done("1  " + records[0].time + "  content://log  app_id=com.example.one feature=AB01\n2  " +
                   records[1].time + "  content://log  extra=two\\nlines\n"));
    EXPECT_EQ(
        device_.json({"usage"})[1],
        nlohmann::json(
            {{"id", 2}, {"time", records[1].time}, {"uri", "content://log"}, {"values", {{"extra", "two\nlines"}}}}));
}

TEST_F(UsageRecords, ADeviceWithoutAnyHasAnEmptyList) {
    EXPECT_EQ(run({"usage"}), done());
    EXPECT_EQ(run({"usage", "--json"}), done("[]\n"));
}
