#include "KestContentSubView.h"

#include "KestCommon.h"
#include "KestContentMgr.h"
#include "KestLog.h"
#include "KestPictureBuilder.h"
#include "KestSizeHints.h"
#include "KestTipMarkup.h"

#include <app-assist/WUiTimer.h>
#include <app-assist/WWindow.h>
#include <app_control.h>
#include <ui_extension.h>

#include <exception>

namespace app_assist {

namespace {

const char pageNumberId[] = "IDS_KESTS_HEADER_KESTS_HP1SD_P2SD_ABB";
const char ownDomain[] = "kest";

/// The catalogue is loaded anew after the pages have heard of the language.
const double secondsToNewLanguage = 0.5;

}  // namespace

KestContentSubView::KestContentSubView(Evas_Object* scroller, int pageIndex, int shownIndex)
    : layout(nullptr), entry(nullptr), infoScroller(nullptr), titleLabel(nullptr), index(pageIndex),
      displayIndex(shownIndex), pictures(scroller), demonstration(pictures, *this) {}

Evas_Object* KestContentSubView::onCreate(Evas_Object* parent, void*) {
    KEST_BEGIN();
    const std::string themeFile = KestCommon::getEdjFilePath(true);
    layout = elm_layout_add(parent);
    if (!layout) {
        KEST_ERR("the layout of page %d could not be made", index);
        return nullptr;
    }
    elm_layout_file_set(layout, themeFile.c_str(), "kest/content/main");
    KestSizeHints::expand(layout);
    // For this page: another pager may lie beneath, and its pages go on listening when this one's go.
    uxt_theme_add_changed_callback(layout, __themeChangedCb, this);
    evas_object_smart_callback_add(layout, "language,changed", __languageChangedCb, this);
    return layout;
}

void KestContentSubView::onPushed(Elm_Object_Item*) {
    KEST_BEGIN();
}

void KestContentSubView::onDestroy() {
    KEST_HIT();
    uxt_theme_delete_changed_callback(layout, __themeChangedCb);
}

void KestContentSubView::onViewPrepare() {
    KEST_BEGIN();
    if (!entry) {
        __fillLayout(layout);
        evas_object_show(layout);
    }
}

void KestContentSubView::onViewDisplay(Elm_Object_Item* naviItem) {
    KEST_BEGIN();
    const size_t count = KestContentMgr::getInstance()->getContentsList().size();
    const std::string text =
        KestTipMarkup::pageNumber(KestCommon::translateString(pageNumberId), index + 1, static_cast<int>(count));
    elm_object_item_domain_translatable_part_text_set(naviItem, "elm.text.title", ownDomain, text.c_str());

    demonstration.restart();
    if (infoScroller) {
        elm_object_signal_emit(infoScroller, "show", "");
    }
    pictures.hideTouchMarkers();
}

void KestContentSubView::onPageScrollStart() {
    demonstration.reset();
}

void KestContentSubView::__fillLayout(Evas_Object* pageLayout) {
    KEST_BEGIN();
    KEST_INFO("index:%d", index);
    KestContentInfo record;
    if (!__copyRecord(record)) {
        return;
    }
    KEST_INFO("contentList[__index].imagePath is %s", record.imagePath.c_str());
    KestPictureBuilder(pictures, getWindow()->getEvasObj()).build(pageLayout, record.imagePath);
    KEST_INFO("imageHeight: %d", pictures.extraHeight);
    demonstration.stop();
    if (pictures.isSequence()) {
        pictures.bringPageIn(0);
        demonstration.createButtonHorizontal(pictures.imageLayout);
    } else if (pictures.isTall()) {
        pictures.bringIn(0);
        demonstration.createButtonVertical(pictures.imageLayout);
    }
    __setInfoArea(pageLayout);
}

void KestContentSubView::__setInfoArea(Evas_Object* pageLayout) {
    KestContentInfo record;
    if (!__copyRecord(record)) {
        return;
    }
    infoScroller = elm_scroller_add(pageLayout);
    elm_scroller_bounce_set(infoScroller, EINA_FALSE, EINA_TRUE);
    elm_scroller_policy_set(infoScroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_AUTO);
    elm_object_style_set(infoScroller, "effect");

    Evas_Object* infoLayout = elm_layout_add(infoScroller);
    KestSizeHints::fill(infoLayout);
    elm_layout_file_set(infoLayout, KestCommon::getEdjFilePath(true).c_str(), "kest/content/scroller");
    elm_object_content_set(infoScroller, infoLayout);

    entry = elm_entry_add(infoLayout);
    elm_object_part_content_set(infoLayout, "entry", entry);
    KestSizeHints::fill(entry);
    evas_object_smart_callback_add(
        entry, "anchor,clicked",
        [](void* data, Evas_Object*, void*) {
            KEST_HIT();
            try {
                const auto* page = static_cast<const KestContentSubView*>(data);
                if (!page) {
                    KEST_ERR("data is null");
                    return;
                }
                KestContentInfo tapped;
                if (page->__copyRecord(tapped)) {
                    __launch(tapped);
                }
            } catch (const std::exception& error) {
                KEST_ERR("%s", error.what());
            }
        },
        this);
    __setText(record);

    titleLabel = elm_label_add(infoLayout);
    __setTitle(record);
    elm_object_part_content_set(infoLayout, "title.area", titleLabel);

    elm_object_part_content_set(pageLayout, "info", infoScroller);
    elm_entry_editable_set(entry, EINA_FALSE);
    elm_entry_scrollable_set(entry, EINA_FALSE);
    evas_object_show(infoScroller);
    evas_object_show(entry);
}

void KestContentSubView::__setTitle(const KestContentInfo& record) {
    elm_label_line_wrap_set(titleLabel, ELM_WRAP_MIXED);
    elm_object_text_set(titleLabel, KestTipMarkup::title(record).c_str());
}

void KestContentSubView::__setText(const KestContentInfo& record) {
    if (record.textContents.empty()) {
        KEST_INFO("contentList[%d].textContents is empty", index);
    }
    elm_entry_entry_set(entry, KestTipMarkup::text(record).c_str());
}

bool KestContentSubView::__copyRecord(KestContentInfo& record) const {
    const std::vector<KestContentInfo>& contentsList = KestContentMgr::getInstance()->getContentsList();
    if (index < 0 || static_cast<size_t>(index) >= contentsList.size()) {
        KEST_INFO("no record for index:%d", index);
        return false;
    }
    record = contentsList[static_cast<size_t>(index)];
    return true;
}

/// Which link was tapped does not matter: all of a page open the same application.
void KestContentSubView::__launch(const KestContentInfo& record) {
    app_control_h request = nullptr;
    app_control_create(&request);
    app_control_set_app_id(request, (record.launchAppid.empty() ? record.appid : record.launchAppid).c_str());
    if (!record.launchParamKey.empty() && !record.launchParamValue.empty()) {
        app_control_add_extra_data(request, record.launchParamKey.c_str(), record.launchParamValue.c_str());
    }
    app_control_send_launch_request(request, nullptr, nullptr);
    app_control_destroy(request);
}

void KestContentSubView::__displayIfOpened() {
    if (index == displayIndex) {
        onViewDisplay(getNaviItem());
    }
}

void KestContentSubView::__themeChangedCb(void* data) try {
    KEST_HIT();
    auto* view = static_cast<KestContentSubView*>(data);
    if (!view) {
        KEST_ERR("data is null");
        return;
    }
    KestContentInfo record;
    if (view->titleLabel && view->__copyRecord(record)) {
        view->__setTitle(record);
    }
    view->__displayIfOpened();
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}

void KestContentSubView::__languageChangedCb(void* data, Evas_Object*, void*) try {
    KEST_HIT();
    auto* view = static_cast<KestContentSubView*>(data);
    if (!view) {
        KEST_ERR("data is null");
        return;
    }
    WUiTimer::addTimer(
        secondsToNewLanguage,
        [view](WView*) {
            KestContentInfo record;
            if (view->entry && view->__copyRecord(record)) {
                view->__setText(record);
                view->__setTitle(record);
            }
            view->__displayIfOpened();
            return false;
        },
        view, view->layout);
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}

}  // namespace app_assist
