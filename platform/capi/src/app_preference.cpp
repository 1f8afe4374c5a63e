#include "app_preference.h"

#include "Service.h"

int preference_set_string(const char* key, const char* value) {
    return service::callOnDevice("preference_set_string", [&](device::Device& device) -> int {
        if (!key || !value)
            return PREFERENCE_ERROR_INVALID_PARAMETER;
        device.preferences().setInOrder(device.application().id, key, value);
        return PREFERENCE_ERROR_NONE;
    });
}

int preference_get_string(const char* key, char** value) {
    return service::callOnDevice("preference_get_string", [&](device::Device& device) -> int {
        if (!key || !value)
            return PREFERENCE_ERROR_INVALID_PARAMETER;
        const auto stored = device.preferences().get(device.application().id, key);
        if (!stored)
            return PREFERENCE_ERROR_NO_KEY;
        *value = service::copyOf(*stored);
        return PREFERENCE_ERROR_NONE;
    });
}

int preference_remove_all(void) {
    return service::callOnDevice("preference_remove_all", [](device::Device& device) -> int {
        device.preferences().clear(device.application().id);
        return PREFERENCE_ERROR_NONE;
    });
}
