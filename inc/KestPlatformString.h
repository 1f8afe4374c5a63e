#pragma once

#include <cstdlib>
#include <string>

/// A character string that the platform returned and that its receiver frees.
class KestPlatformString {
public:
    KestPlatformString() = default;
    explicit KestPlatformString(char* string) : text(string) {}
    ~KestPlatformString() { std::free(text); }
    KestPlatformString(const KestPlatformString&) = delete;
    KestPlatformString& operator=(const KestPlatformString&) = delete;

    /// Where a platform call puts the string; to be used once.
    char** out() { return &text; }
    /// Null when the platform gave none.
    const char* get() const { return text; }
    explicit operator bool() const { return text != nullptr; }
    /// A copy; empty when the platform gave none.
    std::string str() const { return text ? text : ""; }

private:
    char* text = nullptr;
};
