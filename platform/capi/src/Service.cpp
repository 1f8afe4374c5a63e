#include "Service.h"

#include <cstdio>
#include <set>

namespace service {
namespace {

constexpr std::size_t mostReports = 100;  // a failure whose text differs each time must not flood the log

void write(const std::string& text) {
    try {
        device::Device::current().log().write(device::Log::Level::Error, "DEVICE", text);
    } catch (const std::exception&) {
        std::fprintf(stderr, "%s\n", text.c_str());
    }
}

}  // namespace

void report(const std::exception& failure) noexcept {
    try {
        static std::set<std::string> reported;
        const std::string text = failure.what();
        if (reported.size() < mostReports && reported.insert(text).second)
            write(text);
    } catch (const std::exception&) {
        return;  // no memory left to say so
    }
}

}  // namespace service
