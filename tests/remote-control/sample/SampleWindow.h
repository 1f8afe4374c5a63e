#pragma once

#include <Elementary.h>

#include <string>

namespace sample {

/// A screen to look at and to touch: a stack with a list of 40 fruits on a page named "FruitView". Touching a row
/// puts a page named "PageView" on top; it holds a text with two lines.
/// Owns nothing but what the window owns.
class SampleWindow {
public:
    /// `window` is an existing window; it takes everything over.
    /// A talkative one has rows with long texts.
    SampleWindow(Evas_Object* window, const std::string& title, bool talkative = false);

    Evas_Object* stack() const { return stack_; }
    Evas_Object* list() const { return list_; }
    /// How many rows were chosen.
    int choices() const { return choices_; }
    /// Shows another title above the list.
    void setTitle(const std::string& title) const;

private:
    static void onChosen(void* data, Evas_Object* list, void* item);
    void fillList();

    bool talkative_;
    Evas_Object* stack_;
    Evas_Object* list_;
    Elm_Object_Item* page_ = nullptr;
    int choices_ = 0;
};

}  // namespace sample
