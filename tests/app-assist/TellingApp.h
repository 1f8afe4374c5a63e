#pragma once

#include <app-assist/WApp.h>

#include <cstdlib>
#include <functional>
#include <string>
#include <vector>

/// An application that tells what the framework asks of it.
class TellingApp : public app_assist::WApp {
public:
    std::vector<std::string> story;
    bool creates = true;
    std::function<void()> inCreate, inAppControl;

protected:
    void onStart(int argc, char** argv) override { tell("onStart " + std::to_string(argc) + " " + argv[argc - 1]); }
    bool onCreate() override {
        tell("onCreate");
        if (inCreate)
            inCreate();
        return creates;
    }
    void onTerminate() override { tell("onTerminate"); }
    void onPause() override { tell("onPause"); }
    void onResume() override { tell("onResume"); }
    void onAppControl(app_control_h request, bool firstLaunch) override {
        char* id = nullptr;
        app_control_get_app_id(request, &id);
        std::string line = std::string("onAppControl ") + id + (firstLaunch ? " first" : " again");
        std::free(id);
        app_control_foreach_extra_data(
            request,
            [](app_control_h from, const char* key, void* data) {
                char* value = nullptr;
                app_control_get_extra_data(from, key, &value);
                static_cast<std::string*>(data)->append(std::string(" ") + key + "=" + value);
                std::free(value);
                return true;
            },
            &line);
        tell(line);
        if (inAppControl)
            inAppControl();
    }

private:
    void tell(const std::string& what) { story.push_back(what); }
};
