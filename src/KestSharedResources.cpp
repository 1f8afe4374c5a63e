#include "KestSharedResources.h"

#include "KestCommon.h"
#include "KestPaths.h"

std::string KestSharedResources::of(const std::string& appid) {
    const auto known = folders.find(appid);
    if (known != folders.end()) {
        return known->second;
    }
    std::string path;
    if (!KestCommon::findSharedResourcePath(appid, path)) {
        return kest_paths::sharedResources;
    }
    folders[appid] = path;
    return path;
}
