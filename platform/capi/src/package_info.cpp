#include "package_info.h"

#include "package_manager.h"

#include "Service.h"

#include <memory>

struct package_info_s {
    device::Package package;
};

namespace {

int lookUp(const char* name, const char* package, package_info_h* info) {
    if (info)
        *info = nullptr;
    return service::callOnDevice(name, [&](device::Device& device) -> int {
        if (!package || !info)
            return PACKAGE_MANAGER_ERROR_INVALID_PARAMETER;
        auto found = device.packages().find(package);
        if (!found)
            return PACKAGE_MANAGER_ERROR_NO_SUCH_PACKAGE;
        *info = std::make_unique<package_info_s>(package_info_s{std::move(*found)}).release();
        return PACKAGE_MANAGER_ERROR_NONE;
    });
}

}  // namespace

int package_info_create(const char* package, package_info_h* info) {
    return lookUp("package_info_create", package, info);
}

int package_manager_get_package_info(const char* package, package_info_h* info) {
    return lookUp("package_manager_get_package_info", package, info);
}

int package_info_destroy(package_info_h info) {
    return service::call("package_info_destroy", [&]() -> int {
        const std::unique_ptr<package_info_s> owned(info);
        return owned ? PACKAGE_MANAGER_ERROR_NONE : PACKAGE_MANAGER_ERROR_INVALID_PARAMETER;
    });
}

int package_info_get_version(package_info_h info, char** version) {
    return service::call("package_info_get_version", [&]() -> int {
        if (!info || !version)
            return PACKAGE_MANAGER_ERROR_INVALID_PARAMETER;
        *version = service::copyOf(info->package.version);
        return PACKAGE_MANAGER_ERROR_NONE;
    });
}

int package_info_get_icon(package_info_h info, char** path) {
    return service::call("package_info_get_icon", [&]() -> int {
        if (!info || !path)
            return PACKAGE_MANAGER_ERROR_INVALID_PARAMETER;
        *path = info->package.icon.empty() ? nullptr : service::copyOf(info->package.icon);
        return PACKAGE_MANAGER_ERROR_NONE;
    });
}

int package_info_get_label(package_info_h info, char** label) {
    return service::callOnDevice("package_info_get_label", [&](device::Device& device) -> int {
        if (!info || !label)
            return PACKAGE_MANAGER_ERROR_INVALID_PARAMETER;
        *label = service::copyOf(info->package.labelIn(device.language()));
        return PACKAGE_MANAGER_ERROR_NONE;
    });
}
