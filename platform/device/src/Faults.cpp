#include "device/Faults.h"

#include "device/Error.h"

#include <charconv>
#include <map>
#include <string>
#include <system_error>

namespace device::faults {
namespace {

struct Plan {
    int error;
    int count;
    int skip;
};

using Plans = std::map<std::string, Plan, std::less<>>;

Plans& plans() {
    static Plans all;
    return all;
}

bool planned = false;

/// Takes a number from the front of the text; false when none stands there.
bool takeNumber(std::string_view& text, int& number) {
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (error != std::errc())
        return false;
    text.remove_prefix(static_cast<std::size_t>(end - text.data()));
    return true;
}

/// Takes `mark` and a number that is at least `smallest`, if the text begins with the mark; false for another number.
bool takeMarked(std::string_view& text, char mark, int smallest, int& number) {
    if (text.empty() || text.front() != mark)
        return true;
    text.remove_prefix(1);
    return takeNumber(text, number) && number >= smallest;
}

void planWord(std::string_view word) {
    const std::size_t equals = word.find('=');
    Plan parsed{0, 1, 0};
    bool valid = equals != std::string_view::npos && equals > 0;
    if (valid) {
        std::string_view rest = word.substr(equals + 1);
        valid = takeNumber(rest, parsed.error) && takeMarked(rest, 'x', 1, parsed.count) &&
                takeMarked(rest, '+', 0, parsed.skip) && rest.empty();
    }
    if (!valid)
        throw Error("DEVICE_FAULTS: \"" + std::string(word) +
                    "\" is no planned failure; write NAME=ERROR, NAME=ERRORxCOUNT or NAME=ERRORxCOUNT+SKIP");
    plan(word.substr(0, equals), parsed.error, parsed.count, parsed.skip);
}

}  // namespace

void plan(std::string_view service, int error, int count, int skip) {
    if (count < 1) {
        plans().erase(std::string(service));
        return;
    }
    plans().insert_or_assign(std::string(service), Plan{error, count, skip});
    planned = true;
}

void clear() {
    plans().clear();
    planned = false;
}

void planFromText(std::string_view text) {
    while (!text.empty()) {
        const std::size_t comma = text.find(',');
        planWord(text.substr(0, comma));
        text.remove_prefix(comma == std::string_view::npos ? text.size() : comma + 1);
    }
}

std::optional<int> take(std::string_view service) noexcept {
    if (!planned)
        return std::nullopt;
    const auto found = plans().find(service);
    if (found == plans().end())
        return std::nullopt;
    Plan& plan = found->second;
    if (plan.skip > 0) {
        --plan.skip;
        return std::nullopt;
    }
    const int error = plan.error;
    if (--plan.count <= 0)
        plans().erase(found);
    return error;
}

}  // namespace device::faults
