#pragma once

#include <string>

namespace efl_answers {

/// What EFL has to be given so that it draws a text as a device does. EFL gives links no look of their own, while it
/// has one for text in `<link>`; and it takes `align=left` literally, while a device means where a line begins.
/// Links get a `<link>` around them; where `rightToLeft`, lines that are aligned to the left begin where their own
/// language begins. All else stays as it is, well formed or not.
std::string drawnMarkup(const std::string& markup, bool rightToLeft);

}  // namespace efl_answers
