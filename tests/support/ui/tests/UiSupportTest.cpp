#include "ui/UiTest.h"

#include <gtest/gtest-spi.h>

#include <time.h>

namespace {

using test_ui::UiTest;

class UiSupport : public UiTest {
protected:
    /// A list of ten rows that fills the window.
    Evas_Object* list() {
        itemClass_.item_style = "default";
        itemClass_.func.text_get = [](void* data, Evas_Object*, const char* part) -> char* {
            return std::string("elm.text") == part ? strdup(static_cast<const char*>(data)) : nullptr;
        };
        Evas_Object* list = elm_genlist_add(window());
        evas_object_size_hint_weight_set(list, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        elm_win_resize_object_add(window(), list);
        evas_object_show(list);
        for (const char* title : {"one", "two", "three"})
            elm_genlist_item_append(
                list, &itemClass_, title, nullptr, ELM_GENLIST_ITEM_NONE,
                [](void* chosen, Evas_Object*, void*) { ++*static_cast<int*>(chosen); }, &chosen_);
        test_ui::runFor(0.5);
        return list;
    }

    Elm_Genlist_Item_Class itemClass_ = {};
    int chosen_ = 0;
};

double realSeconds() {
    timespec time;
    clock_gettime(CLOCK_MONOTONIC, &time);
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_nsec) * 1e-9;
}

TEST_F(UiSupport, AnHourPassesAtOnceAndTimersComeDueInTheirOrder) {
    static std::string order;
    order.clear();
    const auto append = [](void* text) -> Eina_Bool {
        order += static_cast<const char*>(text);
        return ECORE_CALLBACK_CANCEL;
    };
    ecore_timer_add(3000, append, (void*)"c");
    ecore_timer_add(2, append, (void*)"a");
    ecore_timer_add(2, append, (void*)"b");
    const double began = realSeconds();
    test_ui::runFor(3600);
    EXPECT_EQ("abc", order);
    EXPECT_LT(realSeconds() - began, 10.0);
}

TEST_F(UiSupport, ATapChoosesTheRowUnderTheFinger) {
    const auto rows = test_ui::rows(list());
    ASSERT_EQ(3u, rows.size());
    screen().tap(test_ui::rowGeometry(rows[1]).middle());
    EXPECT_EQ(1, chosen_);
    EXPECT_EQ("two", test_ui::itemText(rows[1], "elm.text"));
}

TEST_F(UiSupport, KeysReachTheWidgetThatHasTheFocus) {
    list();
    screen().key("Down");
    screen().key("Down");
    screen().key("Return");
    EXPECT_EQ(1, chosen_);
}

TEST_F(UiSupport, ASwipeDragsAPage) {
    Evas_Object* scroller = elm_scroller_add(window());
    evas_object_resize(scroller, 720, 1280);
    Evas_Object* wide = evas_object_rectangle_add(screen().canvas());
    evas_object_size_hint_min_set(wide, 1440, 1280);
    elm_object_content_set(scroller, wide);
    elm_scroller_page_relative_set(scroller, 1.0, 0.0);
    evas_object_show(scroller);
    test_ui::runFor(0.5);
    screen().swipe({600, 600}, {150, 600});
    test_ui::runFor(1.0);
    int page = -1;
    elm_scroller_current_page_get(scroller, &page, nullptr);
    EXPECT_EQ(1, page);
}

TEST_F(UiSupport, APictureShowsWhatIsDrawn) {
    Evas_Object* square = evas_object_rectangle_add(screen().canvas());
    evas_object_color_set(square, 200, 0, 0, 255);
    evas_object_geometry_set(square, 10, 20, 30, 40);
    evas_object_show(square);
    const auto picture = screen().picture();
    EXPECT_EQ(720, picture.width());
    EXPECT_EQ(1280, picture.height());
    EXPECT_EQ(30 * 40, picture.count(0xc80000, {0, 0, 720, 1280}));
    EXPECT_EQ(0xc80000u, picture.pixel(10, 20));
    EXPECT_EQ(1, picture.colours({10, 20, 30, 40}));
    const auto file = toolkit_.home().path() / "picture.png";
    EXPECT_TRUE(picture.save(file));
    EXPECT_GT(std::filesystem::file_size(file), 100u);
}

TEST_F(UiSupport, ALineOfEflThatNobodyExpectedFailsTheTest) {
    EXPECT_NONFATAL_FAILURE(
        {
            test_ui::EflLog log;
            EINA_LOG_ERR("a %s went missing", "style");
        },
        "a style went missing");
    EXPECT_NONFATAL_FAILURE(
        {
            test_ui::EflLog log;
            log.expect("never said");
        },
        "EFL did not say: never said");
}

TEST_F(UiSupport, WidgetsAreFoundByTheirType) {
    Evas_Object* inner = elm_button_add(window());
    elm_object_text_set(inner, "a &amp; b");
    evas_object_show(inner);
    Evas_Object* hidden = elm_button_add(window());
    ASSERT_NE(nullptr, hidden);
    EXPECT_EQ(std::vector<Evas_Object*>{inner}, test_ui::widgets(window(), "Elm_Button"));
    EXPECT_EQ("a & b", test_ui::text(inner));

    Evas_Object* label = elm_label_add(window());
    elm_object_text_set(label, "<b>a</b> &amp; b");
    EXPECT_EQ("<b>a</b> &amp; b", test_ui::text(label));
    EXPECT_EQ("a & b", test_ui::plainText(label));
}

}  // namespace
