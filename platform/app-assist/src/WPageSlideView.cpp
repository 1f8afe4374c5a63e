#include "app-assist/WPageSlideView.h"

#include "BounceGuard.h"
#include "Guarded.h"
#include "PageFinger.h"
#include "app-assist/WUiTimer.h"

#include <algorithm>
#include <utility>

namespace app_assist {

WPageSlideView::WPageSlideView() = default;

WPageSlideView::~WPageSlideView() {
    for (WView* page : pages_)
        page->book_ = nullptr;
    if (focusJob_)
        ecore_job_del(focusJob_);
}

Evas_Object* WPageSlideView::onCreate(Evas_Object* parent, void*) {
    scroller_ = elm_scroller_add(parent);
    if (!scroller_)
        return nullptr;
    evas_object_size_hint_weight_set(scroller_, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(scroller_, EVAS_HINT_FILL, EVAS_HINT_FILL);
    finger_ = &PageFinger::attach(scroller_, BounceGuard::attach(scroller_));
    evas_object_event_callback_add(scroller_, EVAS_CALLBACK_RESIZE, scrollerResized, this);
    evas_object_smart_callback_add(
        scroller_, "scroll,page,changed",
        [](void* self, Evas_Object*, void*) { static_cast<WPageSlideView*>(self)->pageTurned(); }, this);
    onInitScroller(scroller_);
    row_ = onCreateLayout(scroller_);
    elm_object_content_set(scroller_, row_);
    return scroller_;
}

Evas_Object* WPageSlideView::onCreateLayout(Evas_Object* parent) {
    Evas_Object* row = elm_box_add(parent);
    elm_box_horizontal_set(row, EINA_TRUE);
    elm_box_layout_set(row, layPagesOut, this, nullptr);
    evas_object_show(row);
    return row;
}

void WPageSlideView::onInitScroller(Evas_Object* scroller) {
    const auto bar = showScroll_ ? ELM_SCROLLER_POLICY_AUTO : ELM_SCROLLER_POLICY_OFF;
    elm_scroller_policy_set(scroller, bar, ELM_SCROLLER_POLICY_OFF);
    elm_scroller_bounce_set(scroller, EINA_TRUE, EINA_FALSE);
    elm_scroller_page_relative_set(scroller, 1.0, 0.0);
    // However hard the swipe, the next page is the one that comes.
    elm_scroller_page_scroll_limit_set(scroller, 1, 0);
}

// By hand: widgets overwrite a size that they were told to have at least, so no box would make them a page wide.
// Where reading begins at the right the first page lies there, as the scroller counts its pages. Only pages that are
// seen move along: all others wait beside the view, because moving everything in them would take most of a frame.
// EFL drags nothing that it shows whole: a row of one page has a pixel more, so that it bounces as a page at either end
// does, and the page stays where it is within that pixel.
void WPageSlideView::layPagesOut(Evas_Object* box, Evas_Object_Box_Data* children, void* data) {
    const auto* view = static_cast<WPageSlideView*>(data);
    int rowX = 0, y = 0, viewX = 0, viewWidth = 0, width = 0, height = 0;
    evas_object_geometry_get(box, &rowX, &y, nullptr, nullptr);
    evas_object_geometry_get(view->scroller_, &viewX, nullptr, &viewWidth, nullptr);
    elm_scroller_region_get(view->scroller_, nullptr, nullptr, &width, &height);
    const int count = static_cast<int>(eina_list_count(children->children));
    const bool mirrored = elm_object_mirrored_get(view->scroller_);
    const int more = count == 1 ? 1 : 0;
    const int begin = rowX + std::clamp(viewX - rowX, 0, more);
    int index = 0;
    const Eina_List* node = nullptr;
    void* each = nullptr;
    EINA_LIST_FOREACH(children->children, node, each) {
        Evas_Object* page = static_cast<Evas_Object_Box_Option*>(each)->obj;
        const int x = begin + width * (mirrored ? count - 1 - index : index);
        evas_object_move(page, std::clamp(x, viewX - width, viewX + viewWidth), y);
        evas_object_resize(page, width, height);
        ++index;
    }
    evas_object_size_hint_min_set(box, width * count + more, height);
}

void WPageSlideView::appendPage(WView* page) {
    if (!page)
        return;
    page->window_ = getWindow();
    page->book_ = this;
    pages_.push_back(page);
    const std::weak_ptr<void> life = page->life();
    if (putInRow(*page) || life.expired())
        return;
    dlog_print(DLOG_ERROR, logTag, "the page %s could not be made", page->getClassName());
    delete page;
}

bool WPageSlideView::putInRow(WView& page) {
    const std::weak_ptr<void> life = page.life();
    if (!row_ || !page.create(row_, nullptr) || life.expired())
        return false;
    page.giveAway();
    elm_box_pack_end(row_, page.getEvasObj());
    evas_object_show(page.getEvasObj());
    elm_object_tree_focus_allow_set(page.getEvasObj(), EINA_FALSE);
    turnFocus();
    page.onSetAsPageContent();
    if (!life.expired())
        page.onPushed(page.getNaviItem());
    return true;
}

void WPageSlideView::pageGone(const WView& page) {
    std::erase(pages_, &page);
}

void WPageSlideView::showPage(int index, bool relayout) {
    if (!scroller_ || index < 0 || index >= getPageCount())
        return;
    if (relayout)
        elm_box_recalculate(row_);
    finger_->keep(index);
    show(index);
}

void WPageSlideView::show(int index) {
    // Before its contents are laid out, a scroller shows another page than it was told.
    evas_smart_objects_calculate(evas_object_evas_get(scroller_));
    elm_scroller_region_get(scroller_, nullptr, nullptr, &width_, nullptr);
    pageInView_ = index;
    if (width_ > 0)
        elm_scroller_page_show(scroller_, index, 0);
    turnFocus();
}

void WPageSlideView::pageTurned() {
    elm_scroller_current_page_get(scroller_, &pageInView_, nullptr);
    turnFocus();
}

// EFL brings into view what gets the focus, and gives it to the first page when any of them is touched. Not at once:
// it takes the place that a page had before the pages moved.
void WPageSlideView::turnFocus() {
    if (!focusJob_)
        focusJob_ = ecore_job_add([](void* self) { static_cast<WPageSlideView*>(self)->focusPageInView(); }, this);
}

void WPageSlideView::focusPageInView() {
    focusJob_ = nullptr;
    evas_smart_objects_calculate(evas_object_evas_get(scroller_));
    for (int i = 0; i < getPageCount(); ++i)
        elm_object_tree_focus_allow_set(pages_[static_cast<size_t>(i)]->getEvasObj(), i == pageInView_);
}

// A scroller that gets another width stays where it was in pixels, which is another page.
void WPageSlideView::scrollerResized(void* data, Evas*, Evas_Object*, void*) {
    auto* view = static_cast<WPageSlideView*>(data);
    elm_box_recalculate(view->row_);
    int width = 0;
    elm_scroller_region_get(view->scroller_, nullptr, nullptr, &width, nullptr);
    if (width == view->width_)
        return;
    const auto showAgain = [view](WView*) {
        elm_box_recalculate(view->row_);
        view->show(view->pageInView_);
        return false;
    };
    WUiTimer::addJob(showAgain, view, view->scroller_);
}

}  // namespace app_assist
