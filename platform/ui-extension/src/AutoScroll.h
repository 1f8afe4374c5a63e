#pragma once

#include <Evas.h>

namespace uxt {

/// Whether a scrolling widget follows the focus: by default it brings a focused child into view.
/// Throws std::invalid_argument for an object that does not scroll, std::runtime_error when EFL refuses.
void setAutoScroll(Evas_Object* scroller, bool enabled);

}  // namespace uxt
