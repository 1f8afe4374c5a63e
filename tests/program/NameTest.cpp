#include "ProgramTest.h"

#include <filesystem>
#include <set>

namespace {

/// What applications are called, in the display language.
class Name : public ProgramTest {
protected:
    static constexpr char clock[] = "com.ravella.clock";

    /// As `kest-device packages` tells it.
    std::string nameOf(const std::string& id) {
        for (const auto& package : device_.json({"packages"}))
            if (package["id"] == id)
                return package["label"];
        return "no package " + id;
    }
};

}  // namespace

TEST_F(Name, OfAnApplicationIsThatWhichItsTipsGiveIt) {
    start();
    for (const auto& folder : std::filesystem::directory_iterator(PROJECT_FOLDER "/res/locale")) {
        const std::string language = folder.path().filename();
        device_.must({"set", "language", language});
        std::set<std::string> names;
        for (const ListRow& row : rows())
            names.insert(row.top);
        for (const char* id : {"clock", "settings", "heartrate", "exercise", "messages", "phone", "music", "weather",
                               "flashlight", "wallet"})
            EXPECT_TRUE(names.contains(nameOf(std::string("com.ravella.") + id)))
                << language << ": " << nameOf(std::string("com.ravella.") + id);
    }
}

TEST_F(Name, OfAnApplicationIsShownByItAndFollowsTheLanguage) {
    device_.must({"set", "language", "de_DE"});
    device_.must({"start", "--headless", "--", clock});
    EXPECT_EQ(titleBar(), "Uhr");
    device_.must({"set", "language", "ko_KR"});
    EXPECT_EQ(titleBar(), "시계");
}
