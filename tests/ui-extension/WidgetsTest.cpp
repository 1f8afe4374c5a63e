#include "ChangeableTest.h"

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class Button : public ChangeableTest {};

TEST_F(Button, HasTheStyleThatWasAskedFor) {
    Evas_Object* button = uxt_button_add(window(), "round");
    ASSERT_NE(nullptr, button);
    const char* group = nullptr;
    edje_object_file_get(elm_layout_edje_get(button), nullptr, &group);
    EXPECT_STREQ("elm/button/base/round", group);
    EXPECT_NE(nullptr, uxt_button_add(window(), nullptr));
    EXPECT_THAT(device_.logMessages(), IsEmpty());
}

TEST_F(Button, OfAnUnknownStyleIsAnOrdinaryButton) {
    Evas_Object* button = uxt_button_add(window(), "no such style");
    ASSERT_NE(nullptr, button);
    const char* group = nullptr;
    edje_object_file_get(elm_layout_edje_get(button), nullptr, &group);
    EXPECT_STREQ("elm/button/base/default", group);
    EXPECT_THAT(device_.logMessages(),
                ElementsAre("W UXT uxt_button_add: the theme has no button style \"no such style\""));
}

TEST_F(Button, WithoutAParentIsNone) {
    EXPECT_EQ(nullptr, uxt_button_add(nullptr, "round"));
}

/// A pager of three pages with a button on each.
class AutoScroll : public ChangeableTest {
protected:
    void SetUp() override {
        ChangeableTest::SetUp();
        scroller_ = elm_scroller_add(window());
        evas_object_resize(scroller_, 720, 1280);
        Evas_Object* box = elm_box_add(scroller_);
        elm_box_horizontal_set(box, EINA_TRUE);
        for (Evas_Object*& button : buttons_) {
            Evas_Object* page = elm_table_add(box);
            Evas_Object* sizer = evas_object_rectangle_add(screen().canvas());
            evas_object_size_hint_min_set(sizer, 720, 1280);
            elm_table_pack(page, sizer, 0, 0, 1, 1);
            button = elm_button_add(page);
            evas_object_show(button);
            elm_table_pack(page, button, 0, 0, 1, 1);
            evas_object_show(page);
            elm_box_pack_end(box, page);
        }
        evas_object_show(box);
        elm_object_content_set(scroller_, box);
        elm_scroller_page_relative_set(scroller_, 1.0, 0.0);
        evas_object_show(scroller_);
        test_ui::runFor(0.5);
    }

    int page() const {
        int page = -1;
        elm_scroller_current_page_get(scroller_, &page, nullptr);
        return page;
    }

    void focus(int button) {
        elm_object_focus_set(buttons_[button], EINA_TRUE);
        test_ui::runFor(1);
    }

    Evas_Object* scroller_ = nullptr;
    Evas_Object* buttons_[3] = {};
};

TEST_F(AutoScroll, AScrollerFollowsTheFocus) {
    focus(1);
    EXPECT_EQ(1, page());
}

TEST_F(AutoScroll, SwitchedOffAScrollerStaysWhereItIs) {
    uxt_scroller_set_auto_scroll_enabled(scroller_, EINA_FALSE);
    uxt_scroller_set_auto_scroll_enabled(scroller_, EINA_FALSE);
    focus(2);
    EXPECT_EQ(0, page());
    EXPECT_EQ(buttons_[2], elm_object_focused_object_get(window()));
}

TEST_F(AutoScroll, SwitchedOffAScrollerStillTurnsPagesForAFingerAndForACall) {
    uxt_scroller_set_auto_scroll_enabled(scroller_, EINA_FALSE);
    screen().swipe({600, 1000}, {150, 1000});
    test_ui::runFor(1);
    EXPECT_EQ(1, page());
    elm_scroller_page_bring_in(scroller_, 2, 0);
    test_ui::runFor(1);
    EXPECT_EQ(2, page());
    elm_scroller_region_bring_in(scroller_, 0, 0, 720, 1280);
    test_ui::runFor(1);
    EXPECT_EQ(0, page());
}

TEST_F(AutoScroll, SwitchedOnAgainAScrollerFollowsTheFocus) {
    uxt_scroller_set_auto_scroll_enabled(scroller_, EINA_FALSE);
    focus(1);
    uxt_scroller_set_auto_scroll_enabled(scroller_, EINA_TRUE);
    focus(2);
    EXPECT_EQ(2, page());
}

TEST_F(AutoScroll, WhatDoesNotScrollIsSaid) {
    uxt_scroller_set_auto_scroll_enabled(buttons_[0], EINA_FALSE);
    uxt_scroller_set_auto_scroll_enabled(nullptr, EINA_FALSE);
    const std::string line = "E UXT uxt_scroller_set_auto_scroll_enabled: the object does not scroll";
    EXPECT_THAT(device_.logMessages(), ElementsAre(line, line));
}

}  // namespace
