#pragma once

#include <filesystem>
#include <string>

namespace device {

/// Copies a package's folder. Follows no links: throws Error, naming the entry, for what is neither a file nor a
/// folder, and for what cannot be read or written. Leaves a part of the copy behind when it throws.
void copyPackage(const std::filesystem::path& from, const std::filesystem::path& to);

/// Puts the folder `fresh` in the place of `target` in one step; what stood there lies in `fresh` afterwards, or in
/// "<fresh>-old". Throws Error when that fails; `target` is then what it was.
void replaceFolder(const std::filesystem::path& fresh, const std::filesystem::path& target);

/// A new empty folder in `parent`; its name begins with `prefix`. Throws Error when it cannot be made.
std::filesystem::path makeTemporaryFolder(const std::filesystem::path& parent, const std::string& prefix);

}  // namespace device
