#include "Catalogue.h"
#include "Rules.h"
#include "Texts.h"

#include "ui/UiTest.h"

#include <algorithm>
#include <gmock/gmock.h>

namespace catalogue {
namespace {

using testing::IsEmpty;

const std::filesystem::path project = PROJECT_FOLDER;

struct Display {
    const char* name;
    double scale;
    int width;
    int rowHeight;
};

void PrintTo(const Display& display, std::ostream* stream) {
    *stream << display.name;
}

/// One row of the list, as the device's theme draws it on one of its displays.
class Row : public test_ui::UiTest, public testing::WithParamInterface<Display> {
protected:
    Row() {
        elm_config_scale_set(GetParam().scale);
        elm_app_base_scale_set(2.6);
        row_ = elm_layout_add(window(GetParam().width, GetParam().rowHeight));
        EXPECT_TRUE(elm_layout_file_set(row_, DEVICE_THEME, "elm/genlist/item_compress/2line.bottom/default"));
        evas_object_resize(row_, GetParam().width, GetParam().rowHeight);
        evas_object_show(row_);
    }

    /// By how many pixels a text is wider than the part's place in the row; 0 where it fits.
    int excess(const char* part, const std::string& text) {
        elm_object_part_text_set(row_, part, text.c_str());
        Evas_Object* edje = elm_layout_edje_get(row_);
        edje_object_calc_force(edje);
        const Evas_Object* drawn = edje_object_part_object_get(edje, part);
        const char* font = nullptr;
        Evas_Font_Size size = 0;
        evas_object_text_font_get(drawn, &font, &size);
        Evas_Object* whole = evas_object_text_add(evas_object_evas_get(row_));
        evas_object_scale_set(whole, evas_object_scale_get(drawn));
        evas_object_text_style_set(whole, evas_object_text_style_get(drawn));
        evas_object_text_font_set(whole, font, size);
        evas_object_text_text_set(whole, text.c_str());
        int place = 0;
        int needed = 0;
        edje_object_part_geometry_get(edje, part, nullptr, nullptr, &place, nullptr);
        evas_object_geometry_get(whole, nullptr, nullptr, &needed, nullptr);
        evas_object_del(whole);
        return std::max(0, needed - place);
    }

private:
    Evas_Object* row_ = nullptr;
};

TEST_P(Row, HasRoomForTheTitleAndTheApplicationsNameOfEveryTipInEveryLanguage) {
    Problems tooLong;
    for (const Tip& tip : readCatalogue(project)) {
        for (const std::string& language : languagesIn(DEVICE_TEXTS)) {
            const auto check = [&](const char* part, const std::string& id) {
                const std::string text = textIn(language, tip, id, sharedText).value_or(id);
                if (const int pixels = excess(part, text))
                    tooLong.push_back(tip.path + ": \"" + text + "\" is " + std::to_string(pixels) +
                                      " pixels too long in " + language);
            };
            check("elm.text.main.left.bottom", tip.detail.titleId.text);
            check("elm.text.sub.left.top", tip.detail.appNameId.text);
        }
    }
    EXPECT_THAT(tooLong, IsEmpty());
}

TEST_P(Row, HasNoRoomForALongerTitle) {
    EXPECT_EQ(0, excess("elm.text.main.left.bottom", "Find your way"));
    EXPECT_GT(excess("elm.text.main.left.bottom", "Find your way around with one finger and the side key"), 0);
}

INSTANTIATE_TEST_SUITE_P(Titles, Row, testing::Values(Display{"large", 2.6, 720, 148}, Display{"small", 1.7, 480, 97}),
                         [](const auto& instance) { return instance.param.name; });

}  // namespace
}  // namespace catalogue
