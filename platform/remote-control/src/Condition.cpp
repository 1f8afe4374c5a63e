#include "Condition.h"

#include "TextSearch.h"
#include "device/Error.h"

#include <algorithm>
#include <charconv>
#include <functional>
#include <map>

namespace remote_control {

namespace {

bool anyElement(const std::vector<Element>& elements, const std::function<bool(const Element&)>& matches) {
    return std::any_of(elements.begin(), elements.end(), [&](const Element& element) {
        const bool inRows = std::any_of(element.rows.begin(), element.rows.end(),
                                        [&](const Row& row) { return anyElement(row.element.children, matches); });
        return matches(element) || inRows || anyElement(element.children, matches);
    });
}

}  // namespace

Condition::Condition(const std::string& words) {
    static const std::map<std::string, Kind> kinds{
        {"text", Kind::Text}, {"no-text", Kind::NoText}, {"view", Kind::View}, {"rows", Kind::Rows}};
    const std::size_t equals = words.find('=');
    const auto kind = kinds.find(words.substr(0, equals));
    if (equals == std::string::npos || kind == kinds.end()) {
        throw device::Error("unknown condition \"" + words +
                            "\"; there are text=TEXT, no-text=TEXT, view=NAME and rows=NUMBER");
    }
    kind_ = kind->second;
    value_ = words.substr(equals + 1);
    if (value_.empty()) {
        throw device::Error("the condition \"" + words + "\" says nothing after its \"=\"");
    }
    if (kind_ == Kind::Rows) {
        const char* end = value_.data() + value_.size();
        const auto [stop, error] = std::from_chars(value_.data(), end, number_);
        if (error != std::errc() || stop != end) {
            throw device::Error("the condition \"" + words + "\" needs a number after its \"=\"");
        }
    }
}

bool Condition::holdsOn(const std::vector<Element>& screen) const {
    switch (kind_) {
    case Kind::Text:
        return showsText(screen, value_);
    case Kind::NoText:
        return !showsText(screen, value_);
    case Kind::View:
        return anyElement(screen, [&](const Element& e) { return e.visible() && e.name == value_; });
    case Kind::Rows:
        return anyElement(screen, [&](const Element& e) {
            return e.visible() && e.type == "Elm_Genlist" && e.rows.size() == number_;
        });
    }
    return false;
}

}  // namespace remote_control
