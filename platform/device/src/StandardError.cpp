#include "device/StandardError.h"

#include <cerrno>
#include <cstdio>
#include <exception>
#include <mutex>
#include <set>

namespace device {

void sayErrorOnce(const std::string& text) noexcept {
    try {
        static std::mutex mutex;
        static std::set<std::string> said;
        const std::lock_guard lock(mutex);
        if (said.insert(text).second)
            std::fprintf(stderr, "%s: error: %s\n", program_invocation_short_name, text.c_str());
    } catch (const std::exception&) {
        return;  // no memory left to say so
    }
}

}  // namespace device
