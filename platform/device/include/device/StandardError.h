#pragma once

#include <string>

namespace device {

/// Writes "PROGRAM: error: TEXT" to standard error, unless this process has said the same before: a failure may be
/// met in many places. Never throws.
void sayErrorOnce(const std::string& text) noexcept;

}  // namespace device
