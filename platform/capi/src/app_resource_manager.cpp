#include "app_resource_manager.h"

#include "Service.h"

#include <algorithm>
#include <filesystem>

namespace {

bool isFile(const std::filesystem::path& path) {
    std::error_code error;
    return std::filesystem::is_regular_file(path, error);
}

bool staysBelow(const std::filesystem::path& relative) {
    return relative.is_relative() && std::find(relative.begin(), relative.end(), "..") == relative.end();
}

/// "" when there is no such file.
std::string resolved(device::Device& device, const std::filesystem::path& id) {
    if (!staysBelow(id))
        return "";
    const std::filesystem::path resources = device.application().root / "res";
    const std::string& folder = device.screen().resourceFolder;
    if (!folder.empty() && isFile(resources / folder / id))
        return (resources / folder / id).string();
    return isFile(resources / id) ? (resources / id).string() : "";
}

}  // namespace

int app_resource_manager_get(app_resource_e, const char* id, char** path) {
    if (path)
        *path = nullptr;
    return service::callOnDevice("app_resource_manager_get", [&](device::Device& device) -> int {
        if (!id || !path)
            return APP_RESOURCE_ERROR_INVALID_PARAMETER;
        const std::string file = resolved(device, id);
        if (file.empty())
            return APP_RESOURCE_ERROR_IO_ERROR;
        *path = service::copyOf(file);
        return APP_RESOURCE_ERROR_NONE;
    });
}
