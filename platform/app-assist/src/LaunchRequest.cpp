#include "LaunchRequest.h"

#include <device/Error.h>
#include <device/OneLine.h>

#include <stdexcept>
#include <string_view>
#include <utility>

namespace app_assist {

namespace {

constexpr std::string_view activation = "--dbus-activated";

bool hasScheme(const std::string& word) {
    const auto colon = word.find(':');
    return colon != std::string::npos && colon < word.find('=');
}

/// What the application's link stands for; nullopt for a word that is none.
std::optional<device::Extras> extrasOfLink(const std::string& word, const LaunchRequest::LinkOfApplication& link) {
    // Other words are for any application, and are refused before it is known which one this is.
    if (!hasScheme(word))
        return std::nullopt;
    const std::optional<device::Link> form = link();
    if (!form || !form->isSchemeOf(word))
        return std::nullopt;
    try {
        return form->extrasOf(word);
    } catch (const device::Error& fault) {
        throw std::invalid_argument(fault.what());
    }
}

device::Extras extrasOfWords(int argc, const char* const* argv) {
    device::Extras extras;
    for (int i = 1; i < argc; ++i) {
        const std::string word = argv[i];
        const auto equals = word.find('=');
        if (equals == std::string::npos || equals == 0)
            throw std::invalid_argument("'" + device::oneLine(word) +
                                        "' is no extra of a launch request: write KEY=VALUE");
        extras.emplace_back(word.substr(0, equals), word.substr(equals + 1));
    }
    return extras;
}

}  // namespace

LaunchRequest::Words LaunchRequest::parse(int argc, const char* const* argv, const LinkOfApplication& link) {
    if (argc > 1 && argv[1] == activation) {
        if (argc > 2)
            throw std::invalid_argument(std::string(activation) +
                                        " goes without extras: the launch request comes over the bus");
        return {{}, true};
    }
    device::LaunchRequest request;
    if (auto extras = argc == 2 ? extrasOfLink(argv[1], link) : std::nullopt)
        request.extras = *std::move(extras);
    else
        request.extras = extrasOfWords(argc, argv);
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
