#include "SampleTest.h"

using remote_control::Element;
using remote_control::Rectangle;
using remote_control::Text;
using testing::Contains;
using testing::ElementsAre;
using testing::SizeIs;

namespace {

class ScreenReader : public SampleTest {};

std::vector<std::string> wordsOf(const std::vector<Text>& texts) {
    std::vector<std::string> words;
    for (const Text& text : texts) {
        words.push_back(text.text);
    }
    return words;
}

}  // namespace

TEST_F(ScreenReader, FindsAWidgetWithItsTypeNameStyleGroupAndPlace) {
    const Element list = find(read(), "Elm_Genlist");

    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    evas_object_geometry_get(sample_->list(), &x, &y, &width, &height);
    EXPECT_EQ(list.name, "FruitView");
    EXPECT_EQ(list.style, "default");
    EXPECT_EQ(list.group, "elm/genlist/base/default");
    EXPECT_EQ(list.place, (Rectangle{x, y, width, height}));
    EXPECT_EQ(list.seen, list.place);
}

TEST_F(ScreenReader, TellsEveryRowOfAListAlsoThoseOutOfSight) {
    const Element list = find(read(), "Elm_Genlist");

    ASSERT_THAT(list.rows, SizeIs(40));
    EXPECT_EQ(list.rows.front().index, 1);
    EXPECT_EQ(list.rows.front().style, "default");
    EXPECT_THAT(wordsOf(list.rows.front().element.texts), ElementsAre("Apple"));
    EXPECT_EQ(list.rows.front().element.texts.front().part, "elm.text");
    EXPECT_TRUE(list.rows.front().element.visible());
    EXPECT_EQ(list.rows.back().index, 40);
    EXPECT_FALSE(list.rows.back().element.visible());
}

TEST_F(ScreenReader, DrawsTheRowsOneBelowTheOther) {
    const Element list = find(read(), "Elm_Genlist");

    const Rectangle first = list.rows[0].element.place;
    const Rectangle second = list.rows[1].element.place;
    EXPECT_EQ(first.y, list.place.y);
    EXPECT_EQ(second.y, first.y + first.height);
    EXPECT_EQ(second.width, 720);
}

TEST_F(ScreenReader, ARowThatIsScrolledInIsInSightAndTheFirstIsNotAnyMore) {
    elm_genlist_item_show(elm_genlist_last_item_get(sample_->list()), ELM_GENLIST_ITEM_SCROLLTO_IN);
    test_ui::runFor(1);

    const Element list = find(read(), "Elm_Genlist");

    EXPECT_TRUE(list.rows.back().element.visible());
    EXPECT_THAT(wordsOf(list.rows.back().element.texts), ElementsAre("Fruit 39"));
    EXPECT_FALSE(list.rows.front().element.visible());
}

TEST_F(ScreenReader, TellsTheTitleAndTheViewOfEachItemOfTheStack) {
    elm_genlist_item_selected_set(elm_genlist_first_item_get(sample_->list()), EINA_TRUE);
    test_ui::runFor(1);

    const Element stack = find(read(), "Elm_Naviframe");

    ASSERT_THAT(stack.items, SizeIs(2));
    EXPECT_EQ(stack.items[0].title, "Fruits");
    EXPECT_EQ(stack.items[0].view, "FruitView");
    EXPECT_FALSE(stack.items[0].top);
    EXPECT_EQ(stack.items[1].title, "Page");
    EXPECT_EQ(stack.items[1].view, "PageView");
    EXPECT_TRUE(stack.items[1].top);
}

TEST_F(ScreenReader, APageThatIsCoveredIsNotInSight) {
    elm_genlist_item_selected_set(elm_genlist_first_item_get(sample_->list()), EINA_TRUE);
    test_ui::runFor(1);

    const auto screen = read();

    EXPECT_FALSE(find(screen, "Elm_Genlist").visible());
    EXPECT_TRUE(find(screen, "Elm_Entry").visible());
}

TEST_F(ScreenReader, GivesMarkupAsItReads) {
    elm_genlist_item_selected_set(elm_genlist_first_item_get(sample_->list()), EINA_TRUE);
    test_ui::runFor(1);

    EXPECT_THAT(wordsOf(textsOf(read())), Contains("A page with a <text> and a second line"));
}

TEST_F(ScreenReader, ReadsTextsFromTopToBottomAndThoseOutOfSightLast) {
    const std::vector<Text> texts = textsOf(read());

    ASSERT_THAT(texts, SizeIs(testing::Ge(41U)));
    EXPECT_EQ(texts[0].text, "Fruits");
    EXPECT_EQ(texts[1].text, "Apple");
    EXPECT_EQ(texts[2].text, "Fruit 1");
    EXPECT_TRUE(texts.back().seen.empty());
}

TEST_F(ScreenReader, AHiddenWidgetIsNotInSight) {
    evas_object_hide(sample_->stack());

    EXPECT_FALSE(find(read(), "Elm_Genlist").visible());
}
