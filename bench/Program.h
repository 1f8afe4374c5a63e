#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace bench {

/// The variable that names the file descriptor on which a program under measurement tells what was seen.
constexpr char toldVariable[] = "BENCH_TOLD_FD";

/// Has programs draw into memory and keep their files below `folder`, their device in `folder`/device.
void prepareEnvironment(const std::filesystem::path& folder);

/// Runs a program with a library loaded ahead of it (LD_PRELOAD) until it ends, without its output, and returns what
/// the library told. Throws std::runtime_error when that was nothing or the program did not end well.
std::string toldBy(const std::vector<std::string>& command, const char* library);

}  // namespace bench
