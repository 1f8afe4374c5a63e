#pragma once

#include "Element.h"

#include <string>
#include <vector>

namespace remote_control {

/// The one text in sight that `wanted` names: the text that equals it, else the only one that holds it.
/// Throws device::Error when none does, when several do, or when it is out of sight; the message says which texts
/// there are.
Text findText(const std::vector<Element>& screen, const std::string& wanted);

/// Where a finger would touch to hit `wanted` within `text`: the middle of what is in sight of it, which is one of its
/// lines where it stands in a block of text. Empty when it is out of sight, also where other words of the block are
/// not.
Rectangle touchPlace(const Text& text, const std::string& wanted);

/// Whether some text in sight equals or holds `wanted`.
bool showsText(const std::vector<Element>& screen, const std::string& wanted);

}  // namespace remote_control
