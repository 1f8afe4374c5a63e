#pragma once

#include <app-assist/WPageSlideView.h>

#include <cstdint>
#include <string>
#include <vector>

namespace app_assist {
class KestContentSubView;
}

/// The screen that opens over the main list: a pager with one page per tip menu, in the order of the catalogue. All
/// pages are there from the start; the chosen one is filled first, the others a moment later.
class KestContentView : public app_assist::WPageSlideView {
public:
    /// `listIndex` is the genlist index of the chosen row, from firstListIndex on.
    /// `pushOnTop` false makes the view the top item without a transition.
    KestContentView(int listIndex, bool pushOnTop);
    ~KestContentView() override;

    /// Shows menu `index` (from 0) at once. Called for a launch request while the pager is open.
    void showContentsPage(int index);
    /// False when the catalogue has other menus by now than the pager was made for.
    bool isOfCatalogue() const;

    /// The genlist index of the first menu: the list's indices count from 1, and row 1 is the title row.
    static const int firstListIndex = 2;
    /// A catalogue has no more menus than this.
    static const std::int32_t mostPages = 15;

protected:
    Evas_Object* onCreate(Evas_Object* parent, void* viewParam) override;
    void onCreated() override {}
    void onDestroy() override { going = true; }
    Elm_Object_Item* onPushToNaviframe(Evas_Object* naviframe) override;
    void onPushed(Elm_Object_Item* naviItem) override;

private:
    void __initScroller();
    /// Null for a menu without a page, and when the pages are about to go.
    app_assist::KestContentSubView* __pageAt(std::int32_t menu) const;
    /// The scroller knows the pages by their places; one that could not be made has none.
    std::int32_t __placeOf(std::int32_t menu) const;
    /// -1 for a place without a page.
    std::int32_t __menuAt(std::int32_t place) const;
    std::int32_t __menuInView() const;
    void __appendPages();
    void __prepareChosenPage(Elm_Object_Item* naviItem);
    void __preparePages();
    void __prepare(std::int32_t menu);
    void __display(std::int32_t menu, Elm_Object_Item* naviItem);

    static void __backCb(void* data, Evas_Object* obj, void* event_info);
    static void __pageScrollStartCb(void* data, Evas_Object* obj, void* event_info);
    static void __pageScrollStopCb(void* data, Evas_Object* obj, void* event_info);

    /// The page that was opened, or that a launch request chose last; a swipe leaves it alone.
    std::int32_t __selectedView;
    /// The base deletes the pages, once they are appended. Null where a page could not be made.
    app_assist::KestContentSubView* pages[mostPages];
    std::int32_t pageCount;
    bool pushOnTop;
    /// Which menus the pages are for, in their order.
    std::vector<std::string> menuKeys;
    /// How many of the pages were handed to the base.
    std::int32_t appended;
    /// The menu whose page is displayed; -1 while none has come to rest.
    std::int32_t displayed;
    bool going;
};
