#include "AppControl.h"
#include "Service.h"

#include <memory>

namespace {

int codeOf(device::Launcher::Result result) {
    switch (result) {
    case device::Launcher::Result::Accepted:
        return APP_CONTROL_ERROR_NONE;
    case device::Launcher::Result::NotFound:
        return APP_CONTROL_ERROR_APP_NOT_FOUND;
    case device::Launcher::Result::Rejected:
        return APP_CONTROL_ERROR_LAUNCH_REJECTED;
    case device::Launcher::Result::Failed:
        return APP_CONTROL_ERROR_LAUNCH_FAILED;
    }
    return APP_CONTROL_ERROR_LAUNCH_FAILED;
}

}  // namespace

int app_control_create(app_control_h* app_control) {
    return service::call("app_control_create", [&]() -> int {
        if (!app_control)
            return APP_CONTROL_ERROR_INVALID_PARAMETER;
        *app_control = std::make_unique<app_control_s>().release();
        return APP_CONTROL_ERROR_NONE;
    });
}

int app_control_destroy(app_control_h app_control) {
    return service::call("app_control_destroy", [&]() -> int {
        const std::unique_ptr<app_control_s> owned(app_control);
        return owned ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_INVALID_PARAMETER;
    });
}

int app_control_set_app_id(app_control_h app_control, const char* app_id) {
    return service::call("app_control_set_app_id", [&]() -> int {
        if (!app_control || !app_id)
            return APP_CONTROL_ERROR_INVALID_PARAMETER;
        app_control->appId = app_id;
        return APP_CONTROL_ERROR_NONE;
    });
}

int app_control_get_app_id(app_control_h app_control, char** app_id) {
    return service::call("app_control_get_app_id", [&]() -> int {
        if (!app_control || !app_id)
            return APP_CONTROL_ERROR_INVALID_PARAMETER;
        if (app_control->appId.empty())
            return APP_CONTROL_ERROR_KEY_NOT_FOUND;
        *app_id = service::copyOf(app_control->appId);
        return APP_CONTROL_ERROR_NONE;
    });
}

int app_control_add_extra_data(app_control_h app_control, const char* key, const char* value) {
    return service::call("app_control_add_extra_data", [&]() -> int {
        if (!app_control || !key || !*key || !value)
            return APP_CONTROL_ERROR_INVALID_PARAMETER;
        app_control->extras.insert_or_assign(key, value);
        return APP_CONTROL_ERROR_NONE;
    });
}

int app_control_get_extra_data(app_control_h app_control, const char* key, char** value) {
    return service::call("app_control_get_extra_data", [&]() -> int {
        if (!app_control || !key || !*key || !value)
            return APP_CONTROL_ERROR_INVALID_PARAMETER;
        const auto found = app_control->extras.find(key);
        if (found == app_control->extras.end())
            return APP_CONTROL_ERROR_KEY_NOT_FOUND;
        *value = service::copyOf(found->second);
        return APP_CONTROL_ERROR_NONE;
    });
}

int app_control_foreach_extra_data(app_control_h app_control, app_control_extra_data_cb callback, void* user_data) {
    return service::call("app_control_foreach_extra_data", [&]() -> int {
        if (!app_control || !callback)
            return APP_CONTROL_ERROR_INVALID_PARAMETER;
        // The callback may change the extras.
        const std::map<std::string, std::string> extras = app_control->extras;
        for (const auto& [key, value] : extras)
            if (!callback(app_control, key.c_str(), user_data))
                break;
        return APP_CONTROL_ERROR_NONE;
    });
}

int app_control_send_launch_request(app_control_h app_control, app_control_reply_cb callback, void*) {
    return service::callOnDevice("app_control_send_launch_request", [&](device::Device& device) -> int {
        if (!app_control)
            return APP_CONTROL_ERROR_INVALID_PARAMETER;
        if (callback)
            return APP_CONTROL_ERROR_NOT_SUPPORTED;
        return codeOf(device.launcher().launch(
            {device.application().id, app_control->appId, {app_control->extras.begin(), app_control->extras.end()}}));
    });
}
