#include "app_common.h"

#include "Service.h"

char* app_get_resource_path(void) {
    char* path = nullptr;
    service::callOnDevice("app_get_resource_path", [&](device::Device& device) {
        path = service::copyOf((device.application().root / "res/").string());
        return TIZEN_ERROR_NONE;
    });
    return path;
}

int app_get_id(char** id) {
    return service::callOnDevice("app_get_id", [&](device::Device& device) {
        if (!id)
            return TIZEN_ERROR_INVALID_PARAMETER;
        *id = service::copyOf(device.application().id);
        return TIZEN_ERROR_NONE;
    });
}
