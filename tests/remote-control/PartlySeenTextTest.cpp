#include "SampleTest.h"
#include "TextSearch.h"

using remote_control::findText;
using remote_control::Rectangle;
using remote_control::showsText;
using remote_control::Text;
using remote_control::textsOf;
using remote_control::touchPlace;

namespace {

/// A text of many lines in a scroller that shows a few of them. "first" and "last" begin and end it.
class PartlySeenText : public SampleTest {
protected:
    static constexpr int top = 200, height = 300;

    void SetUp() override {
        SampleTest::SetUp();
        std::string text = "first";
        for (int line = 0; line < 100; ++line)
            text += "<br/>line " + std::to_string(line) + " again";
        entry_ = elm_entry_add(window());
        elm_entry_editable_set(entry_, EINA_FALSE);
        elm_object_text_set(entry_, (text + "<br/>last").c_str());
        evas_object_size_hint_weight_set(entry_, EVAS_HINT_EXPAND, 0);
        evas_object_size_hint_align_set(entry_, EVAS_HINT_FILL, 0);
        scroller_ = elm_scroller_add(window());
        elm_object_content_set(scroller_, entry_);
        evas_object_geometry_set(scroller_, 0, top, 720, height);
        evas_object_show(entry_);
        evas_object_show(scroller_);
        test_ui::runFor(1);
    }
    void scrollTo(int y) {
        elm_scroller_region_show(scroller_, 0, y, 720, height);
        test_ui::runFor(1);
    }
    int end() const {
        int whole = 0;
        elm_scroller_child_size_get(scroller_, nullptr, &whole);
        return whole - height;
    }
    Rectangle placeOf(const std::string& words) { return touchPlace(findText(read(), words), words); }
    std::string refusal(const std::string& words) {
        const std::string message = errorOf([&] { findText(read(), words); });
        return message.substr(0, message.find("; in sight are: "));
    }
    static std::string outOfSight(const std::string& words) {
        return "the text \"" + words + "\" is out of sight; swipe to bring it in";
    }

    Evas_Object* entry_ = nullptr;
    Evas_Object* scroller_ = nullptr;
};

TEST_F(PartlySeenText, HasWordsThatCanBeTouched) {
    const Rectangle first = placeOf("first");
    EXPECT_GE(first.y, top);
    EXPECT_LT(first.y + first.height, top + height);
    EXPECT_TRUE(showsText(read(), "first"));
}

TEST_F(PartlySeenText, HasWordsThatAreOutOfSight) {
    EXPECT_EQ(refusal("last"), outOfSight("last"));
    EXPECT_FALSE(showsText(read(), "last"));
    scrollTo(end());
    EXPECT_GT(placeOf("last").y, top + height / 2);
    EXPECT_TRUE(showsText(read(), "last"));
    EXPECT_EQ(refusal("first"), outOfSight("first"));
    EXPECT_FALSE(showsText(read(), "first"));
}

TEST_F(PartlySeenText, HasTheWordsThatAreInSightTouchedWhereTheyStandSeveralTimes) {
    scrollTo(end());
    const Rectangle again = placeOf("again");
    EXPECT_GE(again.y, top);
    EXPECT_LE(again.y + again.height, top + height);
}

TEST_F(PartlySeenText, IsTouchedWhereItIsInSightWhenAllOfItIsMeant) {
    std::vector<Text> blocks;
    for (const Text& text : textsOf(read()))
        if (text.text.starts_with("first"))
            blocks.push_back(text);
    ASSERT_EQ(blocks.size(), 1U);
    EXPECT_EQ(placeOf(blocks[0].text), blocks[0].seen);
    EXPECT_LE(blocks[0].seen.height, height);
    EXPECT_GT(blocks[0].place.height, height);
}

}  // namespace
