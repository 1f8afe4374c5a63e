#pragma once

#include <Evas.h>

#include <string>

namespace remote_control {

/// What is on the window, as JSON: {"title", "width", "height", "elements": [...]}. The manual of the command line
/// describes the members.
std::string treeOf(Evas_Object* window);

}  // namespace remote_control
