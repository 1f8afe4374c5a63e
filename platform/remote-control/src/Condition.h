#pragma once

#include "Element.h"

#include <string>
#include <vector>

namespace remote_control {

/// Something that is or is not so on a screen, written as "KIND=VALUE":
///     text=TEXT     some text in sight equals or holds TEXT
///     no-text=TEXT  none does
///     view=NAME     the view of that class is in sight
///     rows=NUMBER   a list in sight has that many rows, its title row included
class Condition {
public:
    /// Throws device::Error that names the faulty word and says which there are.
    explicit Condition(const std::string& words);

    bool holdsOn(const std::vector<Element>& screen) const;

private:
    enum class Kind { Text, NoText, View, Rows };
    Kind kind_;
    std::string value_;
    std::size_t number_ = 0;
};

}  // namespace remote_control
