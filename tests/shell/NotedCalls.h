#pragma once

#include "Calls.h"

#include <sstream>
#include <string>

/// For those who stand in for a call: noting it.
namespace calls {

void add(std::string line);

inline std::string orNull(const char* text) {
    return text ? text : "null";
}
inline std::string orNull(const void* handle, const char* name) {
    return handle ? name : "null";
}

template <class... Arguments>
void note(const Arguments&... arguments) {
    std::ostringstream line;
    const char* separator = "";
    ((line << separator << arguments, separator = " "), ...);
    add(line.str());
}

}  // namespace calls

// Each call is noted under its own name, then goes through.
#define CALL(result, name, ...)                                                                                        \
    extern "C" result __real_##name(__VA_ARGS__);                                                                      \
    extern "C" result __wrap_##name(__VA_ARGS__);                                                                      \
    result __wrap_##name(__VA_ARGS__)
