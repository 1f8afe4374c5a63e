#include "support/TemporaryDevice.h"
#include "ui/UiTest.h"

#include <gmock/gmock.h>

#include <dlfcn.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

using test_ui::Picture;
using test_ui::Point;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::StartsWith;

constexpr unsigned int red = 0xC80000;

/// Labels and entries in the device's styles.
class EflText : public test_ui::UiTest {
protected:
    EflText() {
        elm_theme_overlay_add(nullptr, TEST_DEVICE_THEME);
        elm_config_scale_set(2.6);
    }

    std::string picture(const std::string& name, int width = 40, int height = 40) {
        const auto file = device_.folder() / name;
        const std::vector<unsigned int> pixels(static_cast<std::size_t>(width * height), 0xFF000000 | red);
        EXPECT_TRUE(Picture(width, height, pixels.data()).save(file));
        return file;
    }

    Evas_Object* shown(Evas_Object* widget) {
        evas_object_resize(widget, 600, 400);
        evas_object_move(widget, 50, 50);
        evas_object_show(widget);
        return widget;
    }
    Evas_Object* label(const std::string& markup) {
        Evas_Object* label = shown(elm_label_add(window()));
        elm_object_text_set(label, markup.c_str());
        test_ui::runFor(0.2);
        return label;
    }
    Evas_Object* entry(const std::string& markup) {
        Evas_Object* entry = elm_entry_add(window());
        evas_object_smart_callback_add(
            entry, "anchor,clicked", [](void* taps, Evas_Object*, void*) { ++*static_cast<int*>(taps); }, &taps_);
        elm_object_text_set(entry, markup.c_str());
        elm_entry_editable_set(entry, EINA_FALSE);
        shown(entry);
        test_ui::runFor(0.2);
        return entry;
    }
    /// How many pixels of a picture are seen.
    int seen() { return screen().picture().count(red, {0, 0, 720, 1280}); }
    /// The place of the text that comes after `markup`.
    static int widthOf(const Evas_Object* label) {
        int width = 0;
        evas_object_textblock_size_native_get(edje_object_part_object_get(elm_layout_edje_get(label), "elm.text"),
                                              &width, nullptr);
        return width;
    }
    static std::string item(const std::string& path) { return "<item size=62x62 href=file:/" + path + "></item>"; }

    support::TemporaryDevice device_;
    int taps_ = 0;
};

TEST_F(EflText, AnswersAreWhatEflItselfCallsToo) {
    for (const char* name :
         {"elm_label_add", "elm_entry_add", "elm_object_part_text_set", "elm_object_part_text_get"}) {
        Dl_info where = {};
        ASSERT_NE(0, dladdr(dlsym(RTLD_DEFAULT, name), &where));
        EXPECT_THAT(where.dli_fname, testing::HasSubstr("efl-answers-tests")) << name;
    }
}

TEST_F(EflText, PicturesInALabelAreDrawnWhereverTheProcessIs) {
    label("Icon " + item(picture("icon.png")) + " and text");
    EXPECT_GT(seen(), 500);
    EXPECT_THAT(device_.logMessages(), IsEmpty());
}

TEST_F(EflText, PicturesInALabelAreDrawnByAWholeUriToo) {
    label("<item size=62x62 href=file://" + picture("icon.png") + "></item>");
    EXPECT_GT(seen(), 500);
}

TEST_F(EflText, PicturesInALabelFollowItsText) {
    Evas_Object* object = label(item(picture("icon.png")));
    elm_object_text_set(object, "no picture");
    test_ui::runFor(0.2);
    EXPECT_EQ(0, seen());
    elm_object_text_set(object, (item(picture("other.png")) + item(picture("third.png"))).c_str());
    test_ui::runFor(0.2);
    EXPECT_GT(seen(), 1000);
}

TEST_F(EflText, PicturesInAnEntryAreDrawnWhereverTheProcessIs) {
    entry("Icon " + item(picture("icon.png")) + " and text");
    EXPECT_GT(seen(), 500);
    EXPECT_THAT(device_.logMessages(), IsEmpty());
}

class EflTextWithABadPicture : public EflText, public testing::WithParamInterface<const char*> {
protected:
    std::string path() const { return device_.folder() / GetParam(); }
    void SetUp() override {
        std::filesystem::create_directory(device_.folder() / "folder");
        ASSERT_EQ(0, mkfifo((device_.folder() / "pipe").c_str(), 0600));
        support::writeFile(device_.folder() / "text", "no picture at all");
        support::writeFile(device_.folder() / "empty", "");
        std::filesystem::create_symlink("/dev/zero", device_.folder() / "zero");
        picture("large.png", 3000, 10);
    }
};

TEST_P(EflTextWithABadPicture, KeepsItsPlaceInALabelAndSaysSoOnce) {
    const int width = widthOf(label("before " + item(picture("good.png")) + " after"));
    Evas_Object* object = label("before " + item(path()) + " after");
    EXPECT_EQ(width, widthOf(object));
    elm_object_text_set(object, ("again " + item(path())).c_str());
    test_ui::runFor(0.2);
    ASSERT_THAT(device_.logMessages(), ElementsAre(StartsWith("E EFL " + path() + ": error: ")));
    EXPECT_THAT(device_.logMessages().front(), testing::EndsWith("; its place in the text stays empty"));
}

TEST_P(EflTextWithABadPicture, KeepsItsPlaceInAnEntry) {
    entry(item(path()) + " after");
    EXPECT_EQ(1, screen().picture().colours({50, 50, 60, 60}));
    EXPECT_GT(screen().picture().colours({115, 50, 100, 60}), 1);
    EXPECT_THAT(device_.logMessages(), ElementsAre(StartsWith("E EFL " + path() + ": error: ")));
}

INSTANTIATE_TEST_SUITE_P(Of, EflTextWithABadPicture,
                         testing::Values("missing.png", "folder", "pipe", "text", "empty", "zero", "large.png"),
                         [](const auto& test) {
                             const std::string name = test.param;
                             return name.substr(0, name.find('.'));
                         });

TEST_F(EflText, PicturesOfAnotherKindOfReferenceAreLeftToEfl) {
    label("<item size=62x62 href=contents/flag.png></item>text");
    label("<item size=62x62></item>text");
    EXPECT_THAT(device_.logMessages(), IsEmpty());
}

TEST_F(EflText, ALabelKeepsItsHeightWhenItsThemeIsLoadedAnew) {
    Evas_Object* object = elm_label_add(window());
    elm_label_line_wrap_set(object, ELM_WRAP_MIXED);
    elm_object_text_set(object, "Find your way with one finger wherever you are and whenever you like");
    Evas_Object* box = shown(elm_box_add(window()));
    evas_object_size_hint_align_set(object, EVAS_HINT_FILL, 0);
    elm_box_pack_end(box, object);
    evas_object_show(object);
    test_ui::runFor(0.2);
    const auto before = test_ui::geometry(object);
    EXPECT_GT(before.height, 60);
    elm_theme_flush(nullptr);
    test_ui::runFor(0.2);
    EXPECT_EQ(before, test_ui::geometry(object));
}

TEST_F(EflText, ALinkIsTappedAfterALongPressToo) {
    Evas_Object* object = entry("One <a href=app>link to tap</a>");
    const Point place = test_ui::link(object, "app").middle();
    screen().tap(place, 2.0);
    test_ui::runFor(0.5);
    const int before = taps_;
    screen().tap(place);
    test_ui::runFor(0.5);
    EXPECT_EQ(before + 1, taps_);
    EXPECT_EQ(nullptr, test_ui::widget(window(), "Elm_Hover"));
}

TEST_F(EflText, ShowsNoPointerWhereTheFingerIs) {
    entry("One");
    const auto before = screen().picture();
    screen().press({400, 75});
    screen().moveTo({402, 75});
    test_ui::runFor(0.3);
    EXPECT_EQ(before, screen().picture());
    screen().lift();
}

TEST_F(EflText, OfAnEntryReadsBackAsItWasWritten) {
    const std::string written = "<font_style='Regular' font_size=36 align=left linegap=10>One <a href=app>two</a></>";
    Evas_Object* object = entry(written);
    EXPECT_EQ(written, test_ui::text(object));
    elm_theme_flush(nullptr);
    test_ui::runFor(0.2);
    EXPECT_EQ(written, test_ui::text(object));
    EXPECT_EQ("One two", test_ui::plainText(object));
    elm_object_text_set(object, "<a href=x>other</a>");
    EXPECT_EQ("<a href=x>other</a>", test_ui::text(object));
    elm_object_text_set(object, nullptr);
    EXPECT_EQ("", test_ui::text(object));
}

TEST_F(EflText, OfAnEntryThatIsAddedToReadsBackAsEflHasIt) {
    Evas_Object* object = entry("one");
    elm_entry_entry_append(object, " two");
    EXPECT_EQ("one two", test_ui::text(object));
}

TEST_F(EflText, OfAnEntryToWriteInIsLeftAlone) {
    Evas_Object* object = elm_entry_add(window());
    elm_object_text_set(object, "One <a href=app>two</a>");
    EXPECT_EQ("One <a href=app>two</a>", test_ui::text(object));
    elm_entry_editable_set(object, EINA_FALSE);
    elm_entry_editable_set(object, EINA_TRUE);
    EXPECT_EQ("One <a href=app>two</a>", test_ui::text(object));
}

}  // namespace
