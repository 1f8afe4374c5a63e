#pragma once

#include <app_control.h>

#include <string>
#include <utility>
#include <vector>

namespace app_assist {

/// A launch request to this application: its extras, and the handle that the application reads them from.
class LaunchRequest {
public:
    using Extras = std::vector<std::pair<std::string, std::string>>;

    /// From the KEY=VALUE words of a command line, the program's name left out.
    /// Throws std::invalid_argument, whose what() is a line for people, for a word that is none.
    static Extras parse(int argc, const char* const* argv);

    LaunchRequest(const std::string& appId, const Extras& extras);
    ~LaunchRequest();
    LaunchRequest(const LaunchRequest&) = delete;
    LaunchRequest& operator=(const LaunchRequest&) = delete;

    app_control_h handle() const { return handle_; }

private:
    app_control_h handle_ = nullptr;
};

}  // namespace app_assist
