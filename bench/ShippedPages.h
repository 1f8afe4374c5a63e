#pragma once

#include "Pages.h"

#include <vector>

namespace bench {

/// The pages that the application shows on the device of the environment, in order, read with the application's own
/// code. Throws std::runtime_error when the catalogue does not load.
std::vector<Page> shippedPages();

}  // namespace bench
