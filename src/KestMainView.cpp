#include "KestMainView.h"

#include "KestCommon.h"
#include "KestContentMgr.h"
#include "KestContentView.h"
#include "KestFiles.h"
#include "KestLog.h"
#include "KestSizeHints.h"
#include "KestUsageLog.h"

#include <app-assist/WNaviframe.h>
#include <app-assist/WUiTimer.h>
#include <ui_extension.h>

#include <cstring>
#include <exception>

/// What a menu row knows of itself; the list frees it with the row.
struct KestMainView::RowData {
    Elm_Object_Item* item;
    unsigned int menuIndex;
    KestMainView* view;
};

Elm_Genlist_Item_Class KestMainView::__menuItc;
Elm_Genlist_Item_Class KestMainView::__titleItc;

KestMainView::KestMainView(bool onTop) : __genlist(nullptr), pushOnTop(onTop), packageManager(nullptr) {
    elm_theme_extension_add(nullptr, KestCommon::getEdjFilePath(true).c_str());
}

KestMainView::~KestMainView() = default;

Evas_Object* KestMainView::onCreate(Evas_Object* parent, void*) {
    const std::string path = KestCommon::getEdjFilePath(true);
    Evas_Object* layout = elm_layout_add(parent);
    elm_layout_file_set(layout, path.c_str(), "kest/list/main");
    KestSizeHints::expand(layout);

    __genlist = __createGenlist(layout);
    // __createGenlist() does not return without one.
    if (!__genlist) {
        KEST_INFO("genlist is null");
    }
    elm_object_part_content_set(layout, "elm.swallow.content", __genlist);
    evas_object_show(layout);

    contentsList = KestContentMgr::getInstance()->getContentsList();
    __setGenlistItcs();
    uxt_theme_add_changed_callback(nullptr, __themeChangedCb, this);
    return layout;
}

void KestMainView::onDestroy() {
    uxt_theme_delete_changed_callback(nullptr, __themeChangedCb);
    package_manager_unset_event_cb(packageManager);
    package_manager_destroy(packageManager);
    packageManager = nullptr;
}

Elm_Object_Item* KestMainView::onPushToNaviframe(Evas_Object* naviframe) {
    WASSERT(getEvasObj() != nullptr);
    // Beneath all pagers, where a launch request opened several.
    Elm_Object_Item* lowest = elm_naviframe_bottom_item_get(naviframe);
    if (pushOnTop || !lowest) {
        return elm_naviframe_item_push(naviframe, nullptr, nullptr, nullptr, getEvasObj(), nullptr);
    }
    return elm_naviframe_item_insert_before(naviframe, lowest, nullptr, nullptr, nullptr, getEvasObj(), nullptr);
}

void KestMainView::onPushed(Elm_Object_Item* naviItem) {
    __createMainList();

    const char title[] = "IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME";
    elm_object_item_domain_translatable_part_text_set(naviItem, "elm.text.title",
                                                      KestCommon::findProperDomain(title).c_str(), title);
    package_manager_create(&packageManager);
    package_manager_set_event_cb(packageManager, __packageEventCb, this);
}

Evas_Object* KestMainView::__createGenlist(Evas_Object* parent) {
    WASSERT_EX(parent, "(parent != __null)", "__parent is null.");
    __genlist = elm_genlist_add(parent);
    WASSERT_EX(__genlist, "(__genlist != __null)", "genlist is not created.");

    KestSizeHints::fill(__genlist);
    elm_genlist_mode_set(__genlist, ELM_LIST_COMPRESS);
    elm_genlist_homogeneous_set(__genlist, EINA_TRUE);
    evas_object_smart_callback_add(__genlist, "language,changed", __languageChangedCb, this);
    elm_genlist_realized_items_update(__genlist);
    evas_object_show(__genlist);
    return __genlist;
}

void KestMainView::__setGenlistItcs() {
    __menuItc.version = ELM_GENLIST_ITEM_CLASS_VERSION;
    __menuItc.item_style = "2line.bottom";
    __menuItc.func.text_get = __getRowText;
    __menuItc.func.content_get = __getRowContent;
    __menuItc.func.del = __deleteRow;

    __titleItc.version = ELM_GENLIST_ITEM_CLASS_VERSION;
    __titleItc.item_style = "groupindex";
    __titleItc.func.text_get = __getTitleText;
}

void KestMainView::__createMainList() {
    Elm_Object_Item* title =
        elm_genlist_item_append(__genlist, &__titleItc, nullptr, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
    elm_genlist_item_select_mode_set(title, ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);

    for (unsigned int i = 0; i < contentsList.size(); ++i) {
        auto* row = new RowData{nullptr, i, this};
        row->item =
            elm_genlist_item_append(__genlist, &__menuItc, row, nullptr, ELM_GENLIST_ITEM_NONE, __selectItemCb, this);
        if (!row->item) {
            delete row;
        }
    }
}

void KestMainView::__popViewAbove() {
    if (!getNaviframe()->isTopView(this)) {
        elm_naviframe_item_pop(getNaviframe()->getEvasObj());
    }
}

void KestMainView::__refreshRows() {
    contentsList = KestContentMgr::getInstance()->getContentsList();
    elm_genlist_realized_items_update(__genlist);
}

const KestContentInfo* KestMainView::__recordAt(unsigned int menuIndex) const {
    return menuIndex < contentsList.size() ? &contentsList[menuIndex] : nullptr;
}

char* KestMainView::__getRowText(void* data, Evas_Object*, const char* part) {
    const auto* row = static_cast<RowData*>(data);
    if (!row) {
        KEST_ERR("data is null");
        return nullptr;
    }
    const KestContentInfo* record = row->view->__recordAt(row->menuIndex);
    if (!record) {
        return nullptr;
    }
    if (!std::strcmp(part, "elm.text.sub.left.top")) {
        return strdup(record->appName.c_str());
    }
    if (!std::strcmp(part, "elm.text.main.left.bottom")) {
        return strdup(record->menuTitle.c_str());
    }
    return nullptr;
}

Evas_Object* KestMainView::__getRowContent(void* data, Evas_Object* obj, const char* part) {
    const auto* row = static_cast<RowData*>(data);
    if (!row) {
        KEST_ERR("data is null");
        return nullptr;
    }
    const KestContentInfo* record = row->view->__recordAt(row->menuIndex);
    if (std::strcmp(part, "elm.icon.1") != 0 || !record || record->iconPath.empty()) {
        return nullptr;
    }
    Evas_Object* layout = elm_layout_add(obj);
    elm_layout_theme_set(layout, "layout", "list/B/type.2", "default");
    KestSizeHints::fill(layout);

    Evas_Object* image = elm_image_add(layout);
    if (!KestFiles::isSpecial(record->iconPath)) {
        elm_image_file_set(image, record->iconPath.c_str(), nullptr);
    }
    KestSizeHints::fill(image);
    elm_object_part_content_set(layout, "elm.swallow.content", image);
    return layout;
}

void KestMainView::__deleteRow(void* data, Evas_Object*) {
    delete static_cast<RowData*>(data);
}

char* KestMainView::__getTitleText(void*, Evas_Object*, const char* part) try {
    if (!std::strcmp(part, "elm.text.main")) {
        return strdup(KestCommon::translateString("IDS_VOICE_BUTTON_TIPS_AND_GUIDELINES_ABB").c_str());
    }
    KEST_INFO("part:%s", part);
    return nullptr;
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
    return nullptr;
}

void KestMainView::__selectItemCb(void* data, Evas_Object*, void* event_info) try {
    auto* item = static_cast<Elm_Object_Item*>(event_info);
    if (!item) {
        KEST_ERR("event_info is NULL");
        return;
    }
    auto* view = static_cast<KestMainView*>(data);
    if (!view) {
        KEST_ERR("data is NULL");
        return;
    }
    elm_genlist_item_selected_set(item, EINA_FALSE);
    const int index = elm_genlist_item_index_get(item);
    KEST_INFO("selected index:%d", index);

    const KestContentInfo* record =
        view->__recordAt(static_cast<unsigned int>(index - KestContentView::firstListIndex));
    if (!record) {
        KEST_ERR("no record for index:%d", index);
        return;
    }
    KestUsageLog::menuChosen(record->menuTitle);
    view->getNaviframe()->push(new KestContentView(index, true), nullptr, nullptr);
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}

void KestMainView::__languageChangedCb(void* data, Evas_Object*, void*) try {
    auto* view = static_cast<KestMainView*>(data);
    if (!view) {
        KEST_ERR("data is null");
        return;
    }
    view->__popViewAbove();
    // The application loads the catalogue anew only after the toolkit has told every widget of the language.
    app_assist::WUiTimer::addJob(
        [](app_assist::WView* changed) {
            static_cast<KestMainView*>(changed)->__refreshRows();
            return false;
        },
        view, nullptr);
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}

void KestMainView::__themeChangedCb(void* data) try {
    auto* view = static_cast<KestMainView*>(data);
    if (!view) {
        KEST_ERR("data is null");
        return;
    }
    KestContentMgr::getInstance()->loadContentsList(false);
    view->__refreshRows();
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}

void KestMainView::__packageEventCb(const char*, const char*, package_manager_event_type_e eventType,
                                    package_manager_event_state_e eventState, int, package_manager_error_e,
                                    void* data) try {
    const bool changesWhatIsInstalled =
        eventType == PACKAGE_MANAGER_EVENT_TYPE_INSTALL || eventType == PACKAGE_MANAGER_EVENT_TYPE_UNINSTALL;
    if (!changesWhatIsInstalled || eventState != PACKAGE_MANAGER_EVENT_STATE_COMPLETED) {
        return;
    }
    auto* view = static_cast<KestMainView*>(data);
    if (!view) {
        KEST_ERR("data is null");
        return;
    }
    view->__popViewAbove();
    KestContentMgr::getInstance()->loadContentsList(true);
    view->contentsList = KestContentMgr::getInstance()->getContentsList();
    elm_genlist_clear(view->__genlist);
    view->__createMainList();
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}
