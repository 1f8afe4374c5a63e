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

/// The other pages are filled when the chosen one has come to rest.
const double secondsToOtherPages = 0.4;

const std::int32_t noMenu = -1;

/// What tells menus apart, in their order.
std::vector<std::string> keysOfCatalogue() {
    std::vector<std::string> keys;
    for (const KestContentInfo& record : KestContentMgr::getInstance()->getContentsList()) {
        keys.push_back(record.appid + " " + record.path);
    }
    return keys;
}

}  // namespace

const std::int32_t KestContentView::mostPages;
const int KestContentView::firstListIndex;

KestContentView::KestContentView(int listIndex, bool onTop)
    : __selectedView(listIndex - firstListIndex), pages(), pageCount(0), pushOnTop(onTop), menuKeys(keysOfCatalogue()),
      appended(0), displayed(noMenu), going(false) {
    KEST_BEGIN();
    KEST_INFO("__selectedView:%d", __selectedView);
    const size_t menus = menuKeys.size();
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
    Elm_Object_Item* top = elm_naviframe_top_item_get(naviframe);
    if (pushOnTop || !top) {
        return elm_naviframe_item_push(naviframe, nullptr, back, nullptr, getEvasObj(), nullptr);
    }
    return elm_naviframe_item_insert_after(naviframe, top, nullptr, back, nullptr, getEvasObj(), nullptr);
}

void KestContentView::onPushed(Elm_Object_Item* naviItem) {
    KEST_BEGIN();
    __appendPages();
    showPage(__placeOf(__selectedView), true);

    app_assist::WUiTimer::addIdler(
        [this, naviItem](app_assist::WView*) {
            __prepareChosenPage(naviItem);
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

// The base deletes a page that cannot be made, and the others stand without it.
void KestContentView::__appendPages() {
    for (; appended < pageCount; ++appended) {
        const int taken = getPageCount();
        appendPage(pages[appended]);
        if (getPageCount() == taken) {
            pages[appended] = nullptr;
        }
    }
}

void KestContentView::__prepareChosenPage(Elm_Object_Item* naviItem) {
    const std::int32_t menu = __pageAt(__selectedView) ? __selectedView : __menuInView();
    if (KestContentSubView* page = __pageAt(menu)) {
        page->onViewPrepare();
        __display(menu, naviItem);
    }
}

// One after the other, so that no frame waits for all of them.
void KestContentView::__preparePages() {
    std::int32_t next = 0;
    app_assist::WUiTimer::addIdler(
        [this, next](app_assist::WView*) mutable {
            __prepare(next);
            return ++next < pageCount;
        },
        this, getEvasObj());
}

void KestContentView::__prepare(std::int32_t menu) {
    KestContentSubView* page = __pageAt(menu);
    if (!page) {
        return;
    }
    const bool wasFilled = page->isFilled();
    page->onViewPrepare();
    // It was reached before there was anything to play.
    if (menu == displayed && !wasFilled && page->isFilled()) {
        __display(menu, getNaviItem());
    }
}

void KestContentView::__display(std::int32_t menu, Elm_Object_Item* naviItem) {
    if (KestContentSubView* page = __pageAt(menu)) {
        displayed = menu;
        page->onViewDisplay(naviItem);
    }
}

// While the view goes its pages go first, and the scroller may still tell of movements.
KestContentSubView* KestContentView::__pageAt(std::int32_t menu) const {
    return !going && menu >= 0 && menu < appended ? pages[menu] : nullptr;
}

std::int32_t KestContentView::__placeOf(std::int32_t menu) const {
    const std::int32_t before = std::max(0, std::min(menu, appended));
    return menu - static_cast<std::int32_t>(std::count(pages, pages + before, nullptr));
}

std::int32_t KestContentView::__menuAt(std::int32_t place) const {
    for (std::int32_t menu = 0; menu < appended; ++menu) {
        if (pages[menu] && __placeOf(menu) == place) {
            return menu;
        }
    }
    return noMenu;
}

std::int32_t KestContentView::__menuInView() const {
    int place = 0;
    elm_scroller_current_page_get(getScroller(), &place, nullptr);
    return __menuAt(place);
}

void KestContentView::showContentsPage(int index) {
    KEST_HIT();
    __selectedView = index;
    KEST_INFO("change view page to %d", __selectedView);
    for (std::int32_t menu = 0; menu < pageCount; ++menu) {
        if (KestContentSubView* page = __pageAt(menu)) {
            page->setDisplayIndex(__selectedView);
        }
    }
    if (__pageAt(__selectedView)) {
        showPage(__placeOf(__selectedView), false);
        __display(__selectedView, getNaviItem());
    }
}

bool KestContentView::isOfCatalogue() const {
    return menuKeys == keysOfCatalogue();
}

void KestContentView::__backCb(void* data, Evas_Object*, void*) {
    if (!data) {
        KEST_ERR("Invalid Param : data");
        return;
    }
    const auto* view = static_cast<KestContentView*>(data);
    elm_naviframe_item_pop(view->getNaviframe()->getEvasObj());
}

void KestContentView::__pageScrollStartCb(void* data, Evas_Object*, void*) try {
    KEST_HIT();
    auto* view = static_cast<KestContentView*>(data);
    if (!view) {
        KEST_ERR("data is null");
        return;
    }
    view->displayed = noMenu;
    for (std::int32_t menu = 0; menu < view->pageCount; ++menu) {
        if (KestContentSubView* page = view->__pageAt(menu)) {
            page->onPageScrollStart();
        }
    }
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}

void KestContentView::__pageScrollStopCb(void* data, Evas_Object*, void*) try {
    KEST_HIT();
    auto* view = static_cast<KestContentView*>(data);
    if (!view) {
        KEST_ERR("data is null");
        return;
    }
    view->__display(view->__menuInView(), view->getNaviItem());
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}
