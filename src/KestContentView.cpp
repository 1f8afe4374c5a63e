#include "KestContentView.h"

#include "KestCommon.h"
#include "KestContentMgr.h"
#include "KestContentSubView.h"
#include "KestLog.h"

#include <app-assist/WNaviframe.h>
#include <app-assist/WUiTimer.h>
#include <ui_extension.h>

#include <algorithm>
#include <exception>

using app_assist::KestContentSubView;

namespace {

/// The list's indices count from 1, and row 1 is the title row.
const int firstMenuIndex = 2;

/// The other pages are filled when the chosen one has come to rest.
const double secondsToOtherPages = 0.4;

}  // namespace

const std::int32_t KestContentView::mostPages;

KestContentView::KestContentView(int listIndex, bool onTop)
    : __selectedView(listIndex - firstMenuIndex), pages(), pageCount(0), pushOnTop(onTop), appended(0) {
    KEST_BEGIN();
    KEST_INFO("__selectedView:%d", __selectedView);
    const size_t menus = KestContentMgr::getInstance()->getContentsList().size();
    WASSERT_EX(menus <= static_cast<size_t>(mostPages), "(menus <= mostPages)",
               "the catalogue has %zu menus, more than the %d pages of the pager", menus, mostPages);
    pageCount = static_cast<std::int32_t>(menus);
}

// Pages that never reached the base, as the view could not be pushed, are nobody else's.
KestContentView::~KestContentView() {
    std::for_each(pages + appended, pages + pageCount, [](const KestContentSubView* page) { delete page; });
}

Evas_Object* KestContentView::onCreate(Evas_Object* parent, void*) {
    KEST_BEGIN();
    Evas_Object* layout = elm_layout_add(parent);
    elm_layout_theme_set(layout, "layout", "application", "default");
    evas_object_size_hint_weight_set(layout, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);

    setShowScroll(false);
    elm_object_part_content_set(layout, "elm.swallow.content", WPageSlideView::onCreate(layout, nullptr));
    __initScroller();
    evas_object_show(layout);
    for (std::int32_t i = 0; i < pageCount; ++i) {
        pages[i] = new KestContentSubView(getScroller(), i, __selectedView);
    }
    return layout;
}

void KestContentView::__initScroller() {
    Evas_Object* scroller = getScroller();
    evas_object_smart_callback_add(scroller, "scroll,anim,stop", __pageScrollStopCb, this);
    evas_object_smart_callback_add(scroller, "scroll,anim,start", __pageScrollStartCb, this);
    elm_scroller_bounce_set(scroller, EINA_TRUE, EINA_FALSE);
    elm_scroller_policy_set(scroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
    elm_object_style_set(scroller, "effect");
    uxt_scroller_set_auto_scroll_enabled(scroller, EINA_FALSE);
}

Elm_Object_Item* KestContentView::onPushToNaviframe(Evas_Object* naviframe) {
    WASSERT(getEvasObj() != nullptr);
    elm_object_item_part_content_unset(getNaviItem(), "title_left_btn");
    Evas_Object* back = KestCommon::createButton(naviframe, "naviframe/back_btn/default", nullptr, __backCb, this);
    if (pushOnTop) {
        return elm_naviframe_item_push(naviframe, nullptr, back, nullptr, getEvasObj(), nullptr);
    }
    return elm_naviframe_item_insert_after(naviframe, elm_naviframe_top_item_get(naviframe), nullptr, back, nullptr,
                                           getEvasObj(), nullptr);
}

void KestContentView::onPushed(Elm_Object_Item* naviItem) {
    KEST_BEGIN();
    while (appended < pageCount) {
        appendPage(pages[appended++]);
    }
    showPage(__selectedView, true);

    app_assist::WUiTimer::addIdler(
        [this, naviItem](app_assist::WView*) {
            if (KestContentSubView* page = __pageAt(__selectedView)) {
                page->onViewPrepare();
                page->onViewDisplay(naviItem);
            }
            return false;
        },
        this, getEvasObj());
    app_assist::WUiTimer::addTimer(
        secondsToOtherPages,
        [this](app_assist::WView*) {
            KEST_INFO("Loading other tabs..");
            __preparePages();
            return false;
        },
        this, getEvasObj());
}

// One after the other, so that no frame waits for all of them.
void KestContentView::__preparePages() {
    std::int32_t next = 0;
    app_assist::WUiTimer::addIdler(
        [this, next](app_assist::WView*) mutable {
            if (KestContentSubView* page = __pageAt(next)) {
                page->onViewPrepare();
            }
            return ++next < pageCount;
        },
        this, getEvasObj());
}

// While the view goes its pages go first, and the scroller may still tell of movements.
KestContentSubView* KestContentView::__pageAt(std::int32_t index) const {
    return index >= 0 && index < appended && getPageCount() == pageCount ? pages[index] : nullptr;
}

void KestContentView::showContentsPage(int index) {
    KEST_HIT();
    __selectedView = index;
    KEST_INFO("change view page to %d", __selectedView);
    showPage(__selectedView, false);
    if (KestContentSubView* page = __pageAt(__selectedView)) {
        page->onViewDisplay(getNaviItem());
    }
}

void KestContentView::__backCb(void* data, Evas_Object*, void*) {
    if (!data) {
        KEST_ERR("Invalid Param : data");
        return;
    }
    const auto* view = static_cast<KestContentView*>(data);
    elm_naviframe_item_pop(view->getNaviframe()->getEvasObj());
}

void KestContentView::__pageScrollStartCb(void* data, Evas_Object*, void*) {
    KEST_HIT();
    const auto* view = static_cast<KestContentView*>(data);
    for (std::int32_t i = 0; i < view->pageCount; ++i) {
        if (KestContentSubView* page = view->__pageAt(i)) {
            page->onPageScrollStart();
        }
    }
}

void KestContentView::__pageScrollStopCb(void* data, Evas_Object* scroller, void*) try {
    KEST_HIT();
    const auto* view = static_cast<KestContentView*>(data);
    int horizontal = 0;
    elm_scroller_current_page_get(scroller, &horizontal, nullptr);
    if (KestContentSubView* page = view->__pageAt(horizontal)) {
        page->onViewDisplay(view->getNaviItem());
    }
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}
