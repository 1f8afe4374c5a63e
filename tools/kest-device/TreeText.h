#pragma once

#include "Output.h"

#include <string>

namespace tool {

/// What is on a screen, for people: one line for each element, row and text, indented by what holds it. What is out
/// of sight stands in parentheses.
std::string treeText(const Json& tree);

}  // namespace tool
