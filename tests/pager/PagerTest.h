#pragma once

#include "Calls.h"

#include "KestContentView.h"

#include "kest/KestUiTest.h"
#include "ui/Undrawn.h"

#include <gmock/gmock.h>

#include <functional>
#include <optional>
#include <set>
#include <string>
#include <vector>

/// The running application with the pager on the screen, over nothing. The catalogue and its pictures are the test's.
class PagerTest : public KestUiTest {
protected:
    /// The pager, with what the framework asks of it within reach.
    struct Pager : KestContentView {
        using KestContentView::KestContentView;
        using KestContentView::onPushed;
        using KestContentView::onPushToNaviframe;
        const char* getClassName() const override { return "KestContentView"; }
    };

    /// Draws a picture of one colour (0xRRGGBB) where a tip finds it by that name, and returns its path.
    std::string drawPicture(const std::string& name, int width = 716, int height = 655,
                            unsigned int colour = 0x336699) const;
    /// Draws "a_01.png" and those that follow, with a touch marker over each picture of `marked` (from 0).
    void drawSequence(int count, const std::set<int>& marked = {}) const;
    /// The path of a picture of that name, whether it is there or not.
    std::string picturePath(const std::string& name) const { return (resources() / "contents/images" / name).string(); }

    /// What makes a tip: its title, its text, and a picture by its name.
    static std::string tip(const std::string& picture, const std::string& text = "Text", const std::string& more = "");
    /// Writes a catalogue of these tips, all of them Kest's own.
    void writeTips(const std::vector<std::string>& tips) const;
    /// One tip that has "a_01.png".
    void writeTip() const { writeTips({tip("a_01.png")}); }

    /// Has the device the display of 480x800, with resources of low density. To be called before it starts.
    void useSmallScreen() const;

    /// Starts the application without a first view.
    void startEmpty();
    /// Pushes the pager at that menu, counting from 0, starting the application before if need be.
    /// `meanwhile` comes before the main loop turns.
    void push(
        int menu = 0, bool onTop = true, const std::function<void(Pager&)>& meanwhile = [](Pager&) {});
    /// Pushes it and waits until the page is filled and displayed; story() begins with the display.
    void open(int menu = 0);
    /// The pager pushed last.
    Pager& pager() { return *pager_; }
    void closePager() { elm_naviframe_item_pop(naviframe().getEvasObj()); }

    /// The layout of that page, and what stands in its parts.
    Evas_Object* page(int index = 0);
    Evas_Object* video(int index = 0) { return elm_object_part_content_get(page(index), "video"); }
    Evas_Object* info(int index = 0) { return elm_object_part_content_get(page(index), "info"); }
    Evas_Object* infoLayout(int index = 0) { return elm_object_content_get(info(index)); }
    Evas_Object* entry(int index = 0) { return elm_object_part_content_get(infoLayout(index), "entry"); }
    Evas_Object* titleLabel(int index = 0) { return elm_object_part_content_get(infoLayout(index), "title.area"); }
    /// The scroller of its pictures, and the layout of one of them.
    Evas_Object* pictureScroller(int index = 0) { return elm_object_part_content_get(video(index), "scroller"); }
    std::vector<Evas_Object*> pictures(int index = 0);
    /// The picture in view, by the scroller's measure.
    int pictureInView(int index = 0);
    /// How far a tall picture is scrolled down.
    int scrolledTo(int index = 0);
    /// The page in view.
    int pageInView();

    /// What the theme says when its reply button goes down and up.
    void pressReply(int index = 0) { say("reply,pressed", index); }
    void releaseReply(int index = 0) { say("reply,uppressed", index); }

    /// A finger's flick across the pictures to the next page (-1: to the one before).
    void swipe(int pages = 1);

    std::string title() { return test_ui::itemText(pager().getNaviItem(), "elm.text.title"); }
    std::vector<kest_log::Line> newErrors() { return kest_log::ofLevel('E', newLog()); }
    /// Lines of one source file since the last look.
    std::vector<kest_log::Line> newLogOf(const std::string& file);

    static std::string fileOf(const Evas_Object* image);

    /// What a page's title line and its text are made of.
    std::string icon() const { return device()->packages().find(kest)->icon; }
    static std::string titleMarkup(const std::string& icon, const std::string& title);
    static std::string textMarkup(const std::string& text);

    bool isDrawn_ = false;  ///< true: each frame is drawn, for tests of what drawing takes

private:
    void say(const char* signal, int index);

    std::optional<test_ui::Undrawn> undrawn_;
    Pager* pager_ = nullptr;
};

/// A page of no interest.
class OtherView : public app_assist::WView {
public:
    const char* getClassName() const override { return "OtherView"; }

protected:
    Evas_Object* onCreate(Evas_Object* parent, void*) override { return elm_button_add(parent); }
};

/// Lines of the two views' source files.
namespace pager_log {

inline constexpr char file[] = "KestContentView.cpp";
inline constexpr char pageFile[] = "KestContentSubView.cpp";
inline constexpr char builderFile[] = "KestPictureBuilder.cpp";

}  // namespace pager_log
