#include "device/ApplicationStart.h"

#include "device/Error.h"
#include "device/Folder.h"
#include "device/OneLine.h"
#include "device/Packages.h"

#include <fcntl.h>
#include <fstream>
#include <unistd.h>

namespace device {
namespace {

constexpr std::size_t longestWords = 500;
constexpr std::streamoff lastBytes = 64 * 1024;

/// Several processes write to one file, so each line goes to its end.
Descriptor openOutput(const Folder& folder, const std::string& appId, bool keep) {
    const std::filesystem::path file = folder.output(appId);
    std::error_code ignored;
    std::filesystem::create_directory(file.parent_path(), ignored);
    const int mode = O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC | O_NOFOLLOW | O_NONBLOCK | (keep ? 0 : O_TRUNC);
    Descriptor output(open(file.c_str(), mode, 0600));
    if (output)
        fcntl(output.get(), F_SETFL, O_APPEND);
    return output;
}

}  // namespace

void requireProgram(const Package& package) {
    if (package.exec.empty())
        throw Error(package.id + " has no program to start: its manifest names none");
    std::error_code ignored;
    if (access(package.exec.c_str(), X_OK) != 0 || !std::filesystem::is_regular_file(package.exec, ignored))
        throw Error(package.id + " cannot start: " + package.exec + " is no program");
}

Process startApplication(const Folder& folder, const Package& package, const ApplicationStart& start) {
    Program program;
    program.words = {package.exec};
    for (const auto& [key, value] : start.extras)
        program.words.push_back(std::string(key).append("=").append(value));
    program.output = openOutput(folder, package.id, start.again);
    program.environment = start.environment;
    program.environment.emplace_back("KEST_DEVICE", folder.root().string());
    return startDetached(program);
}

std::string lastWordsOf(const Folder& folder, const std::string& appId) {
    std::ifstream stream(folder.output(appId), std::ios::binary | std::ios::ate);
    const std::streamoff size = stream.tellg();
    stream.seekg(size > lastBytes ? size - lastBytes : 0);
    std::string last;
    for (std::string line; std::getline(stream, line);)
        if (!line.empty())
            last = line;
    return oneLine(last, longestWords);
}

}  // namespace device
