#include "ChangeableTest.h"

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class DeviceTheme : public ChangeableTest {
protected:
    static std::vector<std::string> overlays() {
        std::vector<std::string> files;
        const Eina_List* node = nullptr;
        void* each = nullptr;
        EINA_LIST_FOREACH(elm_theme_overlay_list_get(nullptr), node, each)
        files.emplace_back(static_cast<const char*>(each));
        return files;
    }
};

TEST_F(DeviceTheme, ColoursTheDevicesStylesLightOrDark) {
    uxt::applyDeviceTheme(false);
    Evas_Object* button = uxt_button_add(window(), "round");
    evas_object_geometry_set(button, 0, 0, 100, 100);
    evas_object_show(button);
    EXPECT_EQ(0xF0F0F0u, pixel(50, 50));
    uxt::applyDeviceTheme(true);
    EXPECT_EQ(0x101010u, pixel(50, 50));
    uxt::applyDeviceTheme(false);
    EXPECT_EQ(0xF0F0F0u, pixel(50, 50));
}

TEST_F(DeviceTheme, IsInstalledOnce) {
    uxt::applyDeviceTheme(false);
    uxt::applyDeviceTheme(true);
    EXPECT_THAT(overlays(), ElementsAre((device_.data() / "device.edj").string()));
}

TEST_F(DeviceTheme, ThatCannotBeReadIsSaidAndLeavesEverythingAsItWas) {
    layout("device-page");
    uxt::applyDeviceTheme(true);
    const std::string file = device_.data() / "device.edj";
    std::filesystem::remove(file);
    support::writeFile(file, "no theme");
    uxt::applyDeviceTheme(false);
    EXPECT_EQ(0x101010u, pixel(10, 10));
    EXPECT_THAT(device_.logMessages(), ElementsAre("E UXT applyDeviceTheme: " + file + ": error: is no theme file"));
}

class Callbacks : public ChangeableTest {
protected:
    static void note(void* text) { heard() += *static_cast<std::string*>(text); }
    static void removeSecond(void*) {
        heard() += "r";
        uxt_theme_delete_changed_callback(nullptr, note);
    }
    static void addOne(void* text) {
        heard() += "+";
        uxt_theme_add_changed_callback(nullptr, note, text);
    }
    static std::string& heard() {
        static std::string text;
        return text;
    }

    void SetUp() override {
        ChangeableTest::SetUp();
        heard().clear();
    }
    void TearDown() override {
        for (int left = 0; left < 3; ++left)
            uxt_theme_delete_changed_callback(nullptr, note);
        uxt_theme_delete_changed_callback(nullptr, removeSecond);
        uxt_theme_delete_changed_callback(nullptr, addOne);
        ChangeableTest::TearDown();
    }

    std::string a_ = "a";
    std::string b_ = "b";
};

TEST_F(Callbacks, AreCalledOldestFirstWithTheirData) {
    uxt_theme_add_changed_callback(nullptr, note, &a_);
    uxt_theme_add_changed_callback(nullptr, note, &b_);
    EXPECT_EQ("", heard());
    uxt::themeChanged();
    EXPECT_EQ("ab", heard());
    EXPECT_THAT(device_.logMessages(), IsEmpty());
}

TEST_F(Callbacks, HearOfAThemeWhenItsColoursAreApplied) {
    layout("card");
    apply(blueTable());
    uxt::applyDeviceTheme(false);
    struct Look {
        test_ui::Screen& screen;
        unsigned int seen;
    } look{screen(), 0};
    const auto see = [](void* data) {
        auto* self = static_cast<Look*>(data);
        self->seen = self->screen.picture().pixel(10, 10);
    };
    uxt_theme_add_changed_callback(nullptr, see, &look);
    uxt::applyDeviceTheme(true);
    uxt::themeChanged();
    uxt_theme_delete_changed_callback(nullptr, see);
    EXPECT_EQ(darkBlue, look.seen);
}

TEST_F(Callbacks, TheOldestOfTwoEqualOnesIsRemoved) {
    uxt_theme_add_changed_callback(nullptr, note, &a_);
    uxt_theme_add_changed_callback(nullptr, note, &b_);
    uxt_theme_delete_changed_callback(nullptr, note);
    uxt::themeChanged();
    EXPECT_EQ("b", heard());
}

TEST_F(Callbacks, AreToldApartByTheirObject) {
    Evas_Object* object = layout("card");
    uxt_theme_add_changed_callback(nullptr, note, &a_);
    uxt_theme_add_changed_callback(object, note, &b_);
    uxt_theme_delete_changed_callback(object, note);
    uxt::themeChanged();
    EXPECT_EQ("a", heard());
}

TEST_F(Callbacks, OneThatIsRemovedByAnotherIsNotCalledAnyMore) {
    uxt_theme_add_changed_callback(nullptr, removeSecond, nullptr);
    uxt_theme_add_changed_callback(nullptr, note, &a_);
    uxt_theme_add_changed_callback(nullptr, note, &b_);
    uxt::themeChanged();
    EXPECT_EQ("rb", heard());
}

TEST_F(Callbacks, OneThatIsAddedByAnotherIsCalledFromTheNextChangeOn) {
    uxt_theme_add_changed_callback(nullptr, addOne, &a_);
    uxt::themeChanged();
    EXPECT_EQ("+", heard());
    uxt::themeChanged();
    EXPECT_EQ("++a", heard());
}

TEST_F(Callbacks, NoneAndAnUnknownOneAreSaid) {
    uxt_theme_add_changed_callback(nullptr, nullptr, nullptr);
    uxt_theme_delete_changed_callback(nullptr, note);
    EXPECT_THAT(device_.logMessages(),
                ElementsAre("E UXT uxt_theme_add_changed_callback: no callback",
                            "E UXT uxt_theme_delete_changed_callback: the callback is not registered"));
}

}  // namespace
