#include "KestSharedResources.h"

#include "KestCommon.h"

const std::string& KestSharedResources::of(const std::string& appid) {
    const auto known = folders.find(appid);
    return known != folders.end() ? known->second : folders[appid] = KestCommon::getSharedResourcePath(appid);
}
