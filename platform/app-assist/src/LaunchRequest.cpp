#include "LaunchRequest.h"

#include <stdexcept>

namespace app_assist {

LaunchRequest::Extras LaunchRequest::parse(int argc, const char* const* argv) {
    Extras extras;
    for (int i = 1; i < argc; ++i) {
        const std::string word = argv[i];
        const auto equals = word.find('=');
        if (equals == std::string::npos || equals == 0)
            throw std::invalid_argument("'" + word + "' is no extra of a launch request: write KEY=VALUE");
        extras.emplace_back(word.substr(0, equals), word.substr(equals + 1));
    }
    return extras;
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
