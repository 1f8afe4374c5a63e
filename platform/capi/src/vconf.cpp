#include "vconf.h"

#include "Service.h"

char* vconf_get_str(const char* key) {
    char* value = nullptr;
    service::callOnDevice("vconf_get_str", [&](device::Device& device) -> int {
        if (!key)
            return TIZEN_ERROR_INVALID_PARAMETER;
        if (const auto stored = device.settings().get(key))
            value = service::copyOf(*stored);
        return TIZEN_ERROR_NONE;
    });
    return value;
}

int vconf_set_str(const char* key, const char* value) {
    const int result = service::callOnDevice("vconf_set_str", [&](device::Device& device) -> int {
        if (!key || !value)
            return TIZEN_ERROR_INVALID_PARAMETER;
        device.settings().set(key, value);
        return TIZEN_ERROR_NONE;
    });
    return result == TIZEN_ERROR_NONE ? 0 : -1;
}
