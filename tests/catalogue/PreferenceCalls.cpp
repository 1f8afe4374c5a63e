#include "PreferenceCalls.h"

namespace preference_calls {

bool isListening = false;
std::vector<std::pair<std::string, std::string>> written;
std::vector<std::string> asked;
std::map<std::string, std::function<void()>> meanwhile;

}  // namespace preference_calls

using namespace preference_calls;

extern "C" {
int __real_preference_set_string(const char* key, const char* value);
int __wrap_preference_set_string(const char* key, const char* value);
int __real_preference_get_string(const char* key, char** value);
int __wrap_preference_get_string(const char* key, char** value);
}

int __wrap_preference_set_string(const char* key, const char* value) {
    if (isListening)
        written.emplace_back(key, value);
    if (const auto event = meanwhile.find(key); event != meanwhile.end())
        event->second();
    return __real_preference_set_string(key, value);
}

int __wrap_preference_get_string(const char* key, char** value) {
    if (isListening)
        asked.emplace_back(key);
    return __real_preference_get_string(key, value);
}
