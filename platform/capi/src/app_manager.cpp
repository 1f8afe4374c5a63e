#include "app_manager.h"

#include "Service.h"

int app_manager_get_shared_resource_path(const char* app_id, char** path) {
    return service::callOnDevice("app_manager_get_shared_resource_path", [&](device::Device& device) -> int {
        if (!app_id || !path)
            return APP_MANAGER_ERROR_INVALID_PARAMETER;
        const auto root = device.packages().rootOf(app_id);
        if (!root)
            return APP_MANAGER_ERROR_NO_SUCH_APP;
        *path = service::copyOf((*root / "shared/res/").string());
        return APP_MANAGER_ERROR_NONE;
    });
}
