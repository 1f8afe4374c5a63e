// The program of every package here: it shows which application it is and what it was asked for, so that a person sees
// that a link has worked.
#include "RequestView.h"

#include <app-assist/WApp.h>
#include <app-assist/WAppEventHandler.h>
#include <app-assist/WNaviframe.h>
#include <app-assist/WWindow.h>
#include <app_common.h>
#include <package_info.h>

#include <cstdlib>

namespace {

/// Takes over a text that a service gave; "" for NULL.
std::string owned(char* text) {
    std::string copy = text ? text : "";
    std::free(text);
    return copy;
}

std::string idOfThisApplication() {
    char* id = nullptr;
    app_get_id(&id);
    return owned(id);
}

/// What the package says of this application; it may have been uninstalled meanwhile.
struct Self {
    std::string label = idOfThisApplication();
    std::string icon;

    Self() {
        package_info_h info = nullptr;
        if (package_info_create(label.c_str(), &info) != PACKAGE_MANAGER_ERROR_NONE)
            return;
        char* text = nullptr;
        if (package_info_get_icon(info, &text) == PACKAGE_MANAGER_ERROR_NONE)
            icon = owned(text);
        if (package_info_get_label(info, &text) == PACKAGE_MANAGER_ERROR_NONE)
            label = owned(text);
        package_info_destroy(info);
    }
};

bool appendLine(app_control_h request, const char* key, void* lines) {
    char* value = nullptr;
    app_control_get_extra_data(request, key, &value);
    static_cast<std::vector<std::string>*>(lines)->push_back(std::string(key) + ": " + owned(value));
    return true;
}

class RequestedApp : public app_assist::WApp {
    bool onCreate() override {
        const Self self;
        attachWindow(new app_assist::WWindow(self.label.c_str(), ELM_WIN_BASIC));
        elm_win_title_set(getWindow()->getEvasObj(), self.label.c_str());
        auto* naviframe = new app_assist::WNaviframe();
        getWindow()->attachBaseUiObject(naviframe, nullptr);
        auto* view = new RequestView(self.icon);
        naviframe->push(view, self.label.c_str(), nullptr);
        const auto rename = [this](app_event_info_h, void*) { showName(); };
        events_.addEventHandler(APP_EVENT_LANGUAGE_CHANGED, rename, nullptr);
        return true;
    }

    void showName() {
        const std::string label = Self().label;
        elm_win_title_set(getWindow()->getEvasObj(), label.c_str());
        auto* naviframe = static_cast<app_assist::WNaviframe*>(getWindow()->getBaseUiObject());
        if (const app_assist::WView* top = naviframe->getTopView())
            elm_object_item_part_text_set(top->getNaviItem(), "elm.text.title", label.c_str());
    }

    void onAppControl(app_control_h request, bool) override {
        auto* naviframe = static_cast<app_assist::WNaviframe*>(getWindow()->getBaseUiObject());
        auto* view = dynamic_cast<RequestView*>(naviframe->getTopView());
        if (!view)
            return;
        std::vector<std::string> lines;
        app_control_foreach_extra_data(request, appendLine, &lines);
        view->show(lines);
    }

    app_assist::WAppEventHandler events_;
};

}  // namespace

int main(int argc, char** argv) {
    return RequestedApp().start(argc, argv);
}
