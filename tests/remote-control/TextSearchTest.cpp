#include "TextSearch.h"

#include "SampleTest.h"

using remote_control::findText;
using remote_control::Rectangle;
using remote_control::showsText;
using remote_control::Text;
using remote_control::touchPlace;

namespace {

class TextSearch : public SampleTest {
protected:
    void openPage() {
        elm_genlist_item_selected_set(elm_genlist_first_item_get(sample_->list()), EINA_TRUE);
        test_ui::runFor(1);
    }

    std::string listOfSight() {
        std::string list;
        for (const Text& text : textsOf(read())) {
            if (!text.seen.empty()) {
                list += (list.empty() ? "\"" : ", \"") + text.text + '"';
            }
        }
        return list;
    }
};

}  // namespace

TEST_F(TextSearch, PrefersTheTextThatIsEqual) {
    EXPECT_EQ(findText(read(), "Fruit 1").text, "Fruit 1");
}

TEST_F(TextSearch, TakesTheOnlyTextThatHoldsTheWords) {
    EXPECT_EQ(findText(read(), "pple").text, "Apple");
}

TEST_F(TextSearch, SaysWhereAnAmbiguousTextStands) {
    std::string places;
    for (const char* fruit : {"Fruit 3", "Fruit 13", "Fruit 23", "Fruit 30"}) {
        const Rectangle seen = findText(read(), fruit).seen;
        places += (places.empty() ? "\"" : ", \"") + std::string(fruit) + "\" at " + std::to_string(seen.centreX()) +
                  "," + std::to_string(seen.centreY());
    }

    EXPECT_EQ(errorOf([this] { findText(read(), "3"); }),
              "the text \"3\" is on the screen 4 times: " + places + "; give more of it, or tap one of these places");
}

TEST_F(TextSearch, SaysWhichTextsThereAreWhenItIsMissing) {
    openPage();

    EXPECT_EQ(errorOf([this] { findText(read(), "Pear"); }),
              "no text \"Pear\" on the screen; in sight are: " + listOfSight());
}

TEST_F(TextSearch, SaysThatATextIsOutOfSight) {
    elm_genlist_item_show(elm_genlist_last_item_get(sample_->list()), ELM_GENLIST_ITEM_SCROLLTO_IN);
    test_ui::runFor(1);

    const std::string message = errorOf([this] { findText(read(), "Apple"); });

    EXPECT_EQ(message.substr(0, 82),
              "the text \"Apple\" is out of sight; swipe to bring it in; in sight are: \"Fruits\", \"F");
}

TEST_F(TextSearch, TouchesWordsWithinAParagraphWhereTheyStand) {
    openPage();
    const Text paragraph = findText(read(), "A page with a <text> and a second line");

    const Rectangle first = touchPlace(paragraph, "A page");
    const Rectangle second = touchPlace(paragraph, "second");

    EXPECT_FALSE(first.empty());
    EXPECT_FALSE(second.empty());
    EXPECT_GE(second.y, first.y + first.height) << "the second line is below the first";
    EXPECT_LT(second.width, paragraph.place.width);
    EXPECT_GT(second.x, first.x);
}

TEST_F(TextSearch, AWholeTextIsTouchedInTheMiddleOfWhatIsInSight) {
    const Text apple = findText(read(), "Apple");

    EXPECT_EQ(touchPlace(apple, "Apple"), apple.seen);
}

TEST_F(TextSearch, ATextIsShownOnlyInSight) {
    EXPECT_TRUE(showsText(read(), "Apple"));
    EXPECT_TRUE(showsText(read(), "ppl"));
    EXPECT_FALSE(showsText(read(), "Pear"));
    openPage();
    EXPECT_FALSE(showsText(read(), "Apple"));
}
