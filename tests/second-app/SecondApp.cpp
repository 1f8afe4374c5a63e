#include <app-assist/WApp.h>
#include <app-assist/WNaviframe.h>
#include <app-assist/WView.h>
#include <app-assist/WWindow.h>
#include <dlog.h>

#include <cstdlib>
#include <cstring>

namespace {

char* rowText(void* data, Evas_Object*, const char* part) {
    return std::strcmp(part, "elm.text.main.left.bottom") == 0 ? strdup(static_cast<const char*>(data)) : nullptr;
}

class DrinksView : public app_assist::WView {
    Evas_Object* onCreate(Evas_Object* parent, void*) override {
        static Elm_Genlist_Item_Class row = {};
        row.version = ELM_GENLIST_ITEM_CLASS_VERSION;
        row.item_style = "2line.bottom";
        row.func.text_get = rowText;
        Evas_Object* list = elm_genlist_add(parent);
        elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
        for (const char* drink : {"Tea", "Coffee"})
            elm_genlist_item_append(list, &row, drink, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
        return list;
    }
};

class DrinksApp : public app_assist::WApp {
    bool onCreate() override {
        dlog_print(DLOG_INFO, "SECOND", "created");
        attachWindow(new app_assist::WWindow("Drinks", ELM_WIN_BASIC));
        getWindow()->attachBaseUiObject(new app_assist::WNaviframe(), nullptr);
        return true;
    }
    void onAppControl(app_control_h request, bool firstLaunch) override {
        char* drink = nullptr;
        app_control_get_extra_data(request, "drink", &drink);
        dlog_print(DLOG_INFO, "SECOND", "asked %sfor %s", firstLaunch ? "" : "again ", drink ? drink : "nothing");
        std::free(drink);
        if (firstLaunch)
            static_cast<app_assist::WNaviframe*>(getWindow()->getBaseUiObject())
                ->push(new DrinksView(), "Drinks", nullptr);
    }
};

}  // namespace

int main(int argc, char** argv) {
    return DrinksApp().start(argc, argv);
}
