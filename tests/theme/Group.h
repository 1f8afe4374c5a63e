#pragma once

#include <Evas.h>

#include <set>
#include <string>

namespace theme_test {

/// What is written in one group of a compiled theme file.
struct Group {
    std::set<std::string> parts;
    /// "signal" of "source", as "source: signal".
    std::set<std::string> signalsIn;
    std::set<std::string> signalsOut;
    /// What its parts are coloured and written with, in all their states.
    std::set<std::string> colourClasses;
    std::set<std::string> textClasses;
};

bool hasGroup(const std::string& file, const std::string& group);
/// The group's data item of that name; "" when there is none.
std::string dataItem(Evas* canvas, const std::string& file, const std::string& group, const std::string& name);
/// Everything else of the group. Throws std::runtime_error when there is no such group.
Group readGroup(Evas* canvas, const std::string& file, const std::string& group);

}  // namespace theme_test
