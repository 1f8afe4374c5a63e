#pragma once

#include "KestContentInfo.h"

#include <app-assist/WView.h>
#include <package_manager.h>

#include <vector>

/// The first screen: a list with a title row and one row per tip menu. Keeps its rows in step with the catalogue
/// when the display language, the theme or the installed packages change.
class KestMainView : public app_assist::WView {
public:
    /// `pushOnTop` false slides the view in beneath all others.
    explicit KestMainView(bool pushOnTop);
    ~KestMainView() override;

protected:
    Evas_Object* onCreate(Evas_Object* parent, void* viewParam) override;
    void onCreated() override {}
    void onDestroy() override;
    Elm_Object_Item* onPushToNaviframe(Evas_Object* naviframe) override;
    void onPushed(Elm_Object_Item* naviItem) override;

private:
    struct RowData;

    Evas_Object* __createGenlist(Evas_Object* parent);
    static void __setGenlistItcs();
    void __createMainList();
    void __popViewAbove();
    void __refreshRows();
    /// Null when a reload has left the row without a record.
    const KestContentInfo* __recordAt(unsigned int menuIndex) const;

    static char* __getRowText(void* data, Evas_Object* obj, const char* part);
    static Evas_Object* __getRowContent(void* data, Evas_Object* obj, const char* part);
    static void __deleteRow(void* data, Evas_Object* obj);
    static char* __getTitleText(void* data, Evas_Object* obj, const char* part);

    static void __selectItemCb(void* data, Evas_Object* obj, void* event_info);
    static void __languageChangedCb(void* data, Evas_Object* obj, void* event_info);
    static void __themeChangedCb(void* data);
    static void __packageEventCb(const char* type, const char* package, package_manager_event_type_e eventType,
                                 package_manager_event_state_e eventState, int progress, package_manager_error_e error,
                                 void* data);

    Evas_Object* __genlist;
    static Elm_Genlist_Item_Class __menuItc;
    static Elm_Genlist_Item_Class __titleItc;
    std::vector<KestContentInfo> contentsList;
    bool pushOnTop;
    package_manager_h packageManager;
};
