#include "Program.h"

#include <cstdlib>
#include <stdexcept>

#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace bench {
namespace {

[[noreturn]] void become(const std::vector<std::string>& command, const char* library, int told) {
    setenv(toldVariable, std::to_string(told).c_str(), 1);
    setenv("LD_PRELOAD", library, 1);
    std::vector<char*> arguments;
    arguments.reserve(command.size() + 1);
    for (const std::string& word : command) {
        arguments.push_back(const_cast<char*>(word.c_str()));
    }
    arguments.push_back(nullptr);
    const int silence = open("/dev/null", O_WRONLY);
    dup2(silence, STDOUT_FILENO);
    dup2(silence, STDERR_FILENO);
    execv(arguments[0], arguments.data());
    _exit(127);
}

std::string readAll(int descriptor) {
    std::string all;
    char block[4096];
    for (ssize_t length = 0; (length = read(descriptor, block, sizeof block)) > 0;) {
        all.append(block, static_cast<size_t>(length));
    }
    return all;
}

}  // namespace

void prepareEnvironment(const std::filesystem::path& folder) {
    std::filesystem::create_directories(folder / "home");
    std::filesystem::create_directories(folder / "run");
    std::filesystem::permissions(folder / "run", std::filesystem::perms::owner_all);
    setenv("HOME", (folder / "home").c_str(), 1);
    setenv("XDG_RUNTIME_DIR", (folder / "run").c_str(), 1);
    setenv("KEST_DEVICE", (folder / "device").c_str(), 1);
    setenv("ELM_ENGINE", "buffer", 1);
    setenv("LANG", "C.UTF-8", 1);
    unsetenv("DISPLAY");
    unsetenv("WAYLAND_DISPLAY");
}

std::string toldBy(const std::vector<std::string>& command, const char* library) {
    int told[2];
    if (pipe(told) != 0) {
        throw std::runtime_error("no pipe");
    }
    const pid_t process = fork();
    if (process == 0) {
        close(told[0]);
        become(command, library, told[1]);
    }
    close(told[1]);
    std::string all = readAll(told[0]);
    close(told[0]);
    int status = 0;
    waitpid(process, &status, 0);
    if (all.empty() || !WIFEXITED(status) || WEXITSTATUS(status) != 0) {
        throw std::runtime_error(command.front() + " ended before all was measured: " + all);
    }
    return all;
}

}  // namespace bench
