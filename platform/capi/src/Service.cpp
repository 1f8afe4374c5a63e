#include "Service.h"

#include "device/StandardError.h"

#include <set>
#include <unistd.h>

namespace service {
namespace {

constexpr std::size_t mostReports = 100;  // a failure whose text differs each time must not flood the log

/// Where there is no log, or it cannot be written either, standard error is left; a terminal shows the log's lines
/// already.
void write(const std::string& text) {
    bool shown = false;
    try {
        shown = device::Device::current().log().write(device::Log::Level::Error, "DEVICE", text) &&
                isatty(STDERR_FILENO) == 1;
    } catch (const std::exception&) {
        shown = false;
    }
    if (!shown)
        device::sayErrorOnce(text);
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
