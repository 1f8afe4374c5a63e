#pragma once

#include <Evas.h>

#include <filesystem>

namespace remote_control {

/// Writes what the window shows as a PNG of the window's size. The file appears whole or not at all; an older one
/// of that name stays until then.
/// Throws device::Error, with nothing left behind, when the name is not absolute or does not end in ".png", or when
/// the file cannot be written.
void writeScreenshot(Evas_Object* window, const std::filesystem::path& file);

}  // namespace remote_control
