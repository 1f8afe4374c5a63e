#pragma once

#include "KestContentInfo.h"
#include "KestDemonstration.h"
#include "KestPictureArea.h"

#include <app-assist/WView.h>

namespace app_assist {

/// One page of the pager, about one tip: pictures that demonstrate the feature by themselves, a title line with the
/// application's icon, and the text, whose links open the application.
class KestContentSubView : public WView {
public:
    /// `pageIndex` is the tip's place in the catalogue, `shownIndex` the page that the pager was opened at; `scroller`
    /// is the pager's.
    KestContentSubView(Evas_Object* scroller, int pageIndex, int shownIndex);

    /// Fills the page, the first time that it is called. The pager calls it when it is idle.
    void onViewPrepare();
    bool isFilled() const { return entry != nullptr; }
    /// The page has become the one in view: writes its number into the title bar and starts its demonstration over.
    void onViewDisplay(Elm_Object_Item* naviItem);
    /// Another page than the pager was opened at is the chosen one from now on.
    void setDisplayIndex(int chosenIndex) { displayIndex = chosenIndex; }
    /// A swipe begins: ends the demonstration and puts the pictures back to their start.
    void onPageScrollStart();

protected:
    Evas_Object* onCreate(Evas_Object* parent, void* viewParam) override;
    void onCreated() override {}
    void onDestroy() override;
    void onPushed(Elm_Object_Item* naviItem) override;

private:
    void __fillLayout(Evas_Object* pageLayout);
    void __setInfoArea(Evas_Object* pageLayout);
    void __setTitle(const KestContentInfo& record);
    void __setText(const KestContentInfo& record);
    void __displayIfOpened();
    /// A copy of the page's record. False, with a line in the log, when a reload has left the page without one.
    bool __copyRecord(KestContentInfo& record) const;
    static void __launch(const KestContentInfo& record);

    static void __themeChangedCb(void* data);
    static void __languageChangedCb(void* data, Evas_Object* obj, void* event_info);

    Evas_Object* layout;
    Evas_Object* entry;
    Evas_Object* infoScroller;
    Evas_Object* titleLabel;
    int index;
    int displayIndex;
    KestPictureArea pictures;
    KestDemonstration demonstration;
};

}  // namespace app_assist
