#pragma once

#include <cstdlib>
#include <string>

/// A character string that the platform returned and that its receiver frees.
class KestPlatformString {
public:
    KestPlatformString() = default;
    explicit KestPlatformString(char* text) : text_(text) {}
    ~KestPlatformString() { std::free(text_); }
    KestPlatformString(const KestPlatformString&) = delete;
    KestPlatformString& operator=(const KestPlatformString&) = delete;

    /// Where a platform call puts the string; to be used once.
    char** out() { return &text_; }
    /// Null when the platform gave none.
    const char* get() const { return text_; }
    explicit operator bool() const { return text_ != nullptr; }
    /// A copy; empty when the platform gave none.
    std::string str() const { return text_ ? text_ : ""; }

private:
    char* text_ = nullptr;
};
