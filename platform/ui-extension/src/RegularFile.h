#pragma once

#include <string>

namespace uxt {

/// The contents of a regular file of at most 1 MiB. It never waits for a pipe or a device.
/// Throws TableError.
std::string readRegularFile(const std::string& file);

}  // namespace uxt
