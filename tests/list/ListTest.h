#pragma once

#include "Calls.h"

#include "kest/KestUiTest.h"

#include <gmock/gmock.h>

#include <string>
#include <utility>
#include <vector>

/// The running application with its list on the screen.
class ListTest : public KestUiTest {
protected:
    /// Texts of a row: the application's name above the menu's title.
    using Texts = std::pair<std::string, std::string>;

    /// Writes a catalogue with a tip for each title, all of them Kest's own; names are "Name of <title>".
    void writeTips(const std::vector<std::string>& titles) const;

    Evas_Object* list() { return test_ui::widget(running().window(), "Elm_Genlist"); }
    /// The row of that menu, counting from 0.
    Elm_Object_Item* menuRow(std::size_t menu);
    Elm_Object_Item* titleRow() { return test_ui::rows(list()).at(0); }
    /// Of all menu rows, in their order.
    std::vector<Texts> menuTexts();
    static Texts texts(const Elm_Object_Item* row);
    static std::string text(const Elm_Object_Item* row, const char* part) { return test_ui::itemText(row, part); }

    /// Gives the application an icon that is a square of that colour (0xRRGGBB), and returns its path.
    std::string drawIcon(unsigned int colour) const;

    /// Pushes a page of no interest, and waits until it stands.
    void pushOtherView();
    /// How many views the naviframe holds.
    unsigned int levels() { return eina_list_count(elm_naviframe_items_get(naviframe().getEvasObj())); }

    void tap(Elm_Object_Item* row);
    /// Taps the menu's row and waits until the pager stands.
    void openPager(std::size_t menu = 0);

    /// The "extra" of each usage record so far.
    std::vector<std::string> usageExtras() const;

    std::vector<kest_log::Line> newErrors() { return kest_log::ofLevel('E', newLog()); }
};

/// A page of no interest.
class OtherView : public app_assist::WView {
public:
    const char* getClassName() const override { return "OtherView"; }

protected:
    Evas_Object* onCreate(Evas_Object* parent, void*) override { return elm_button_add(parent); }
};

/// Lines of the list's source file.
namespace list_log {

inline constexpr char file[] = "KestMainView.cpp";
inline kest_log::Line info(const std::string& function, const std::string& message) {
    return kest_log::info(file, function, message);
}
inline kest_log::Line error(const std::string& function, const std::string& message) {
    return kest_log::error(file, function, message);
}

}  // namespace list_log
