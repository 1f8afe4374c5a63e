#include "ShellTest.h"

#include "KestCommon.h"

using testing::ElementsAre;
using testing::IsEmpty;

class Button : public ShellTest {
protected:
    Evas_Object* create(const char* style, const char* text) {
        Evas_Object* button = KestCommon::createButton(
            window(), style, text, [](void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); }, &clicks_);
        if (button) {
            evas_object_resize(button, 200, 100);
            test_ui::runFor(0.1);
        }
        return button;
    }
    kest_log::Line failure() const {
        return kest_log::error("KestCommon.cpp", "createButton", "uxt_button_add() is failed");
    }

    int clicks_ = 0;
};

TEST_F(Button, OfAStyleIsAThemedOne) {
    Evas_Object* button = create("naviframe/back_btn/default", "Text");
    ASSERT_NE(button, nullptr);
    EXPECT_THAT(calls::madeOf({"uxt_button_add", "elm_button_add"}),
                testing::Contains("uxt_button_add naviframe/back_btn/default"));
    EXPECT_STREQ(elm_object_style_get(button), "naviframe/back_btn/default");
    EXPECT_EQ(test_ui::text(button), "Text");
    EXPECT_THAT(newLog(), IsEmpty());
}

TEST_F(Button, WithoutAStyleIsAPlainOne) {
    Evas_Object* button = create(nullptr, "Text");
    ASSERT_NE(button, nullptr);
    EXPECT_THAT(calls::madeOf({"uxt_button_add", "elm_button_add"}), ElementsAre("elm_button_add"));
    EXPECT_STREQ(elm_object_style_get(button), "default");
    EXPECT_EQ(test_ui::text(button), "Text");
}

TEST_F(Button, MayHaveNoText) {
    Evas_Object* button = create(nullptr, nullptr);
    ASSERT_NE(button, nullptr);
    EXPECT_EQ(elm_object_part_text_get(button, nullptr), nullptr);
}

TEST_F(Button, IsShownAndExpands) {
    Evas_Object* button = create(nullptr, nullptr);
    EXPECT_TRUE(evas_object_visible_get(button));
    double x = 0, y = 0;
    evas_object_size_hint_weight_get(button, &x, &y);
    EXPECT_EQ(x, 1.0);
    EXPECT_EQ(y, 1.0);
}

TEST_F(Button, TellsOfItsClicks) {
    Evas_Object* button = create(nullptr, "Text");
    UiTest::screen().tap(button);
    EXPECT_EQ(clicks_, 1);
    UiTest::screen().tap(button);
    EXPECT_EQ(clicks_, 2);
}

TEST_F(Button, OfAStyleThatCannotBeMadeIsNull) {
    calls::fail("uxt_button_add");
    EXPECT_EQ(create("naviframe/back_btn/default", "Text"), nullptr);
    EXPECT_THAT(newLog(), ElementsAre(failure()));
}

TEST_F(Button, WithoutAStyleThatCannotBeMadeIsNullWithTheSameWords) {
    calls::fail("elm_button_add");
    EXPECT_EQ(create(nullptr, "Text"), nullptr);
    EXPECT_THAT(newLog(), ElementsAre(failure()));
}
