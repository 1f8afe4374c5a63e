#include "ToolTest.h"

#include "device/Keys.h"

namespace {

class Settings : public ToolTest {};

}  // namespace

TEST_F(Settings, AFreshDeviceHasItsOwn) {
    EXPECT_EQ(run({"get", "language"}), done("en_US\n"));
    EXPECT_EQ(run({"get", "theme"}), done("light\n"));
    EXPECT_EQ(run({"get", "screen"}), done("720x1280\n"));
    EXPECT_EQ(run({"get", "country"}), failed("country is not set"));
}

TEST_F(Settings, AreListedWithoutAKey) {
    EXPECT_EQ(run({"get"}), done("language  en_US\nscreen    720x1280\ntheme     light\n"));
    EXPECT_EQ(device_.json({"get"}),
              nlohmann::json({{"language", "en_US"}, {"screen", "720x1280"}, {"theme", "light"}}));
}

TEST_F(Settings, ALanguageIsStoredWithItsCodeset) {
    EXPECT_EQ(run({"set", "language", "ko_KR"}), done());

    EXPECT_EQ(run({"get", "language"}), done("ko_KR\n"));
    EXPECT_EQ(run({"get", device::keys::language}), done("ko_KR.UTF-8\n"));
}

TEST_F(Settings, AnUnknownLanguageThemeOrScreenIsRefusedWithWhatThereIs) {
    std::string languages;
    for (const std::string& language : device_.open().languages()) {
        languages += (languages.empty() ? "" : ", ") + language;
    }
    ASSERT_NE(languages, "");

    EXPECT_EQ(run({"set", "language", "xx"}), failed("there is no language \"xx\"; there are " + languages));
    EXPECT_EQ(run({"set", "theme", "pink"}), failed("there is no theme \"pink\"; there are light, dark"));
    EXPECT_EQ(run({"set", "screen", "1x1"}), failed("there is no screen \"1x1\"; there are 720x1280, 480x800"));
    EXPECT_EQ(run({"get", "language"}), done("en_US\n"));
}

TEST_F(Settings, ACountryClearsThePreferencesOfEveryApplication) {
    device_.open().preferences().set("com.example.one", "key", "value");
    device_.open().preferences().set("com.example.two", "key", "value");

    EXPECT_EQ(run({"set", "country", "IN"}), done());

    EXPECT_EQ(run({"get", "country"}), done("IN\n"));
    EXPECT_EQ(run({"preferences"}), done());
}

TEST_F(Settings, ACountryIsTakenAwayAgain) {
    device_.must({"set", "country", "IN"});
    EXPECT_EQ(run({"set", "country", "none"}), done());
    EXPECT_EQ(run({"get", "country"}), failed("country is not set"));

    device_.must({"set", "country", "IN"});
    EXPECT_EQ(run({"unset", "country"}), done());
    EXPECT_EQ(run({"get", "country"}), failed("country is not set"));
}

TEST_F(Settings, ACountryThatIsNoneIsRefusedAndNothingIsCleared) {
    device_.open().preferences().set("com.example.one", "key", "value");

    EXPECT_EQ(run({"set", "country", "india"}),
              failed("a country is two capital letters such as IN, or none; \"india\" is neither"));

    EXPECT_EQ(run({"preferences"}), done("com.example.one  key  value\n"));
}

TEST_F(Settings, AnyVconfKeyTakesAnyValue) {
    EXPECT_EQ(run({"set", "db/example/key", "a value"}), done());
    EXPECT_EQ(run({"get", "db/example/key"}), done("a value\n"));
    EXPECT_EQ(device_.json({"get", "db/example/key"}),
              nlohmann::json({{"key", "db/example/key"}, {"value", "a value"}}));

    EXPECT_EQ(run({"unset", "db/example/key"}), done());
    EXPECT_EQ(run({"get", "db/example/key"}), failed("db/example/key is not set"));
}

TEST_F(Settings, ThatAreUnsetAreAsOnAFreshDevice) {
    const nlohmann::json fresh = device_.json({"status"});
    device_.must({"set", "language", "ko_KR"});
    device_.must({"set", "theme", "dark"});
    device_.must({"set", "screen", "480x800"});
    ASSERT_NE(device_.json({"status"}), fresh);

    for (const char* name : {"language", "theme", "screen"}) {
        device_.must({"unset", name});
    }
    EXPECT_EQ(run({"get"}), done("language  en_US\nscreen    720x1280\ntheme     light\n"))
        << "a setting that has no value is another thing to an application than the fresh device's value";

    EXPECT_EQ(device_.json({"status"}), fresh);
    EXPECT_EQ(run({"status"}), done("folder    " + root() +
                                    "\nbus       none\nrunning   nothing\nlanguage  en_US\ncountry   none\n"
                                    "theme     light\nscreen    720x1280\n"));
}

TEST_F(Settings, OfAScreenOrAThemeThatDoesNotExistAreToldAsTheDeviceTakesThem) {
    device_.open().settings().set(device::keys::screen, "1x1");
    device_.open().settings().set(device::keys::theme, "pink");

    const nlohmann::json status = device_.json({"status"});
    EXPECT_EQ(status["screen"], "720x1280");
    EXPECT_EQ(status["theme"], "light");
}

TEST_F(Settings, HaveTheSameMeaningUnderTheirKeys) {
    device_.open().preferences().set("com.example.one", "key", "value");

    EXPECT_EQ(run({"set", device::keys::country, "IN"}), done());
    EXPECT_EQ(run({"preferences"}), done());
    EXPECT_EQ(run({"set", device::keys::country, "india"}),
              failed("a country is two capital letters such as IN, or none; \"india\" is neither"));
    EXPECT_EQ(run({"set", device::keys::theme, "pink"}), failed("there is no theme \"pink\"; there are light, dark"));
    EXPECT_EQ(run({"set", device::keys::language, "ko_KR.UTF-8"}), done());
    EXPECT_EQ(run({"get", "language"}), done("ko_KR\n"));
    EXPECT_EQ(run({"unset", device::keys::language}), done());
    EXPECT_EQ(run({"get", device::keys::language}), done("en_US.UTF-8\n"));
    device_.open().preferences().set("com.example.one", "key", "value");
    EXPECT_EQ(run({"unset", device::keys::country}), done());
    EXPECT_EQ(run({"preferences"}), done());
}

TEST_F(Settings, AMistypedNameIsNotTakenForAKey) {
    EXPECT_EQ(run({"set", "langauge", "ko_KR"}),
              failed("there is no setting \"langauge\"; there are language, country, theme, screen, and vconf keys "
                     "such as db/setting/theme"));
}
