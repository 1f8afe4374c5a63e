#include "LaunchRequest.h"

#include <device/OneLine.h>

#include <stdexcept>
#include <string_view>

namespace app_assist {

namespace {

constexpr std::string_view activation = "--dbus-activated";
constexpr std::size_t longestShown = 200;

}  // namespace

LaunchRequest::Words LaunchRequest::parse(int argc, const char* const* argv) {
    if (argc > 1 && argv[1] == activation) {
        if (argc > 2)
            throw std::invalid_argument(std::string(activation) +
                                        " goes without extras: the launch request comes over the bus");
        return {{}, true};
    }
    device::LaunchRequest request;
    for (int i = 1; i < argc; ++i) {
        const std::string word = argv[i];
        const auto equals = word.find('=');
        if (equals == std::string::npos || equals == 0)
            throw std::invalid_argument("'" + device::oneLine(word, longestShown) +
                                        "' is no extra of a launch request: write KEY=VALUE");
        request.extras.emplace_back(word.substr(0, equals), word.substr(equals + 1));
    }
    if (const std::string fault = device::faultOf(request); !fault.empty())
        throw std::invalid_argument(fault);
    return {std::move(request.extras), false};
}

LaunchRequest::LaunchRequest(const std::string& appId, const Extras& extras) {
    if (app_control_create(&handle_) != APP_CONTROL_ERROR_NONE)
        return;
    app_control_set_app_id(handle_, appId.c_str());
    for (const auto& [key, value] : extras)
        app_control_add_extra_data(handle_, key.c_str(), value.c_str());
}

LaunchRequest::~LaunchRequest() {
    if (handle_)
        app_control_destroy(handle_);
}

}  // namespace app_assist
