#pragma once

#include <functional>
#include <map>
#include <string>
#include <utility>
#include <vector>

/// What is written to the application's preferences and asked of them, in order. The calls go through.
namespace preference_calls {

/// Other tests write what nobody wants to keep a second time.
extern bool isListening;
extern std::vector<std::pair<std::string, std::string>> written;
extern std::vector<std::string> asked;
/// What happens beside the load when it writes that key.
extern std::map<std::string, std::function<void()>> meanwhile;

}  // namespace preference_calls
