#pragma once

#include <cstdlib>
#include <optional>
#include <string>
#include <utility>

namespace support {

/// An environment variable as a test wants it; what it was before comes back.
class Environment {
public:
    /// nullopt: not set.
    Environment(std::string name, const std::optional<std::string>& value) : name_(std::move(name)) {
        if (const char* before = std::getenv(name_.c_str()))
            before_ = before;
        put(value);
    }
    ~Environment() { put(before_); }
    Environment(const Environment&) = delete;
    Environment& operator=(const Environment&) = delete;

private:
    void put(const std::optional<std::string>& value) const {
        value ? setenv(name_.c_str(), value->c_str(), 1) : unsetenv(name_.c_str());
    }
    std::string name_;
    std::optional<std::string> before_;
};

}  // namespace support
