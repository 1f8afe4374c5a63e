#pragma once

#include "app_control.h"

#include <map>
#include <string>

/// What a launch request's handle stands for.
struct app_control_s {
    std::string appId;
    std::map<std::string, std::string> extras;
};
