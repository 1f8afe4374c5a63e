#pragma once

#include "Pages.h"

#include <vector>

namespace bench {

/// The pages that the application shows on the device of the environment, in order, read with the application's own
/// code. The device's country is set to India, whose tips have pictures of every kind. Throws std::runtime_error when
/// the catalogue does not load.
std::vector<Page> shippedPages();

}  // namespace bench
