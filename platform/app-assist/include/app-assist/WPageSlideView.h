#pragma once

#include "app-assist/WView.h"

#include <vector>

namespace app_assist {

class PageFinger;

/// A view of pages side by side, one in view at a time, that a swipe turns. Owns the pages that were appended.
/// Only the page in view takes the focus. On the scroller, "scroll,anim,start" and "scroll,anim,stop" come in pairs.
class WPageSlideView : public WView {
public:
    WPageSlideView();
    ~WPageSlideView() override;

    /// Whether the scroll bar shows; to be called before onCreate(). Off by default.
    void setShowScroll(bool show) { showScroll_ = show; }
    /// Null before onCreate().
    Evas_Object* getScroller() const { return scroller_; }

    /// Takes `page` over, creates it and makes it the last page. Null is ignored.
    void appendPage(WView* page);
    /// Brings page `index` into view at once, also before anything was laid out. `relayout` has the pages laid
    /// out first, as is needed when they were just appended. An index outside the pages does nothing.
    /// Under a finger that drags the pages on, it comes back when the finger lifts.
    void showPage(int index, bool relayout);
    int getPageCount() const { return static_cast<int>(pages_.size()); }

protected:
    Evas_Object* onCreate(Evas_Object* parent, void* viewParam) override;
    /// Makes the object that holds the pages in a row.
    virtual Evas_Object* onCreateLayout(Evas_Object* parent);
    /// Sets the scroller up.
    virtual void onInitScroller(Evas_Object* scroller);

private:
    friend class WView;

    bool putInRow(WView& page);
    void pageGone(const WView& page);
    void show(int index);
    void pageTurned();
    void turnFocus();
    void focusPageInView();
    static void layPagesOut(Evas_Object* box, Evas_Object_Box_Data* children, void* view);
    static void scrollerResized(void* view, Evas*, Evas_Object*, void*);

    bool showScroll_ = false;
    Evas_Object* scroller_ = nullptr;
    PageFinger* finger_ = nullptr;  ///< the scroller's
    Evas_Object* row_ = nullptr;
    /// The page that is shown, or will be when the scroller has a width.
    int pageInView_ = 0;
    /// The scroller's, when that page was last shown.
    int width_ = 0;
    Ecore_Job* focusJob_ = nullptr;
    std::vector<WView*> pages_;
};

}  // namespace app_assist
