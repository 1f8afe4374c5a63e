#include "device/LaunchRequest.h"

#include "Utf8.h"
#include "device/OneLine.h"

#include <set>
#include <string_view>

namespace device {
namespace {

/// What an extra costs beside its text, where it is passed on.
constexpr std::size_t bytesOfExtra = 8;
constexpr std::size_t longestShown = 100;

std::string faultOf(const std::string& key, const std::string& value) {
    if (key.empty())
        return "an extra of the launch request has no name; give each one";
    const std::string name = "the extra \"" + oneLine(key, longestShown) + '"';
    if (!isUtf8(key) || !isUtf8(value))
        return name + " is not UTF-8";
    if (key.find('=') != std::string::npos)
        return name + " has a \"=\" in its name";
    return "";
}

}  // namespace

std::size_t LaunchRequest::size() const {
    std::size_t size = appId.size();
    for (const auto& [key, value] : extras)
        size += key.size() + value.size() + bytesOfExtra;
    return size;
}

std::string faultOf(const LaunchRequest& request) {
    if (request.size() > LaunchRequest::mostBytes)
        return "the request is larger than 64 KiB";
    std::set<std::string_view> names;
    for (const auto& [key, value] : request.extras) {
        if (std::string fault = faultOf(key, value); !fault.empty())
            return fault;
        if (!names.insert(key).second)
            return "the extra \"" + oneLine(key, longestShown) + "\" is given twice";
    }
    return "";
}

}  // namespace device
