#include "device/Process.h"

#include "Files.h"
#include "device/Error.h"

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <fcntl.h>
#include <fstream>
#include <spawn.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

namespace device {
namespace {

namespace fs = std::filesystem;
using namespace std::chrono_literals;

constexpr auto patience = 2s;

fs::path procFolder(int id) {
    return fs::path("/proc") / std::to_string(id);
}

/// The kernel ends each with a zero byte.
std::vector<std::string> textsIn(const fs::path& file) {
    std::ifstream stream(file, std::ios::binary);
    std::vector<std::string> texts;
    for (std::string text; std::getline(stream, text, '\0');)
        texts.push_back(text);
    return texts;
}

std::vector<std::string> environmentWith(const std::vector<std::pair<std::string, std::string>>& changes) {
    std::vector<std::string> all;
    for (char** entry = environ; *entry; ++entry) {
        const std::string text = *entry;
        const std::string name = text.substr(0, text.find('='));
        const bool changed =
            std::any_of(changes.begin(), changes.end(), [&](const auto& change) { return change.first == name; });
        if (!changed)
            all.push_back(text);
    }
    for (const auto& [name, value] : changes)
        all.push_back(std::string(name).append("=").append(value));
    return all;
}

std::vector<char*> pointersTo(std::vector<std::string>& texts) {
    std::vector<char*> pointers;
    pointers.reserve(texts.size() + 1);
    for (std::string& text : texts)
        pointers.push_back(text.data());
    pointers.push_back(nullptr);
    return pointers;
}

/// posix_spawn's settings, freed at the end.
class SpawnSettings {
public:
    SpawnSettings() {
        posix_spawn_file_actions_init(&actions);
        posix_spawnattr_init(&attributes);
    }
    ~SpawnSettings() {
        posix_spawn_file_actions_destroy(&actions);
        posix_spawnattr_destroy(&attributes);
    }
    SpawnSettings(const SpawnSettings&) = delete;
    SpawnSettings& operator=(const SpawnSettings&) = delete;

    /// A session of its own, and no signal blocked or ignored: EFL ignores some.
    void standAlone() {
        sigset_t signals;
        sigfillset(&signals);
        posix_spawnattr_setsigdefault(&attributes, &signals);
        sigemptyset(&signals);
        posix_spawnattr_setsigmask(&attributes, &signals);
        posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETSID | POSIX_SPAWN_SETSIGDEF | POSIX_SPAWN_SETSIGMASK);
    }

    posix_spawn_file_actions_t actions{};
    posix_spawnattr_t attributes{};
};

}  // namespace

bool Process::runs() const {
    std::ifstream stream(procFolder(id_) / "stat");
    // Not by iterators, which throw where the process ends before it is read.
    std::string stat;
    std::getline(stream, stat, '\0');
    // The state follows the name, which stands in parentheses and may hold any character.
    const std::size_t name = stat.rfind(") ");
    return name != std::string::npos && stat[name + 2] != 'Z' && stat[name + 2] != 'X';
}

std::vector<std::string> Process::arguments() const {
    return textsIn(procFolder(id_) / "cmdline");
}

std::optional<std::string> Process::variable(const std::string& name) const {
    for (const std::string& text : textsIn(procFolder(id_) / "environ"))
        if (text.starts_with(name + "="))
            return text.substr(name.size() + 1);
    return std::nullopt;
}

bool Process::endsWithin(std::chrono::milliseconds time) const {
    const auto deadline = std::chrono::steady_clock::now() + time;
    while (runs()) {
        if (std::chrono::steady_clock::now() >= deadline)
            return false;
        std::this_thread::sleep_for(5ms);
    }
    return true;
}

void Process::end() const {
    if (id_ <= 0)
        throw Error("a process that cannot be seen from here, for example in a container, has to be ended there");
    kill(id_, SIGTERM);
    if (endsWithin(patience))
        return;
    kill(id_, SIGKILL);
    if (!endsWithin(patience))
        throw Error("process " + std::to_string(id_) + " does not end; end it by hand");
}

Process startDetached(const Program& program) {
    SpawnSettings settings;
    settings.standAlone();
    posix_spawn_file_actions_t* actions = &settings.actions;
    posix_spawn_file_actions_addopen(actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
    if (program.output)
        posix_spawn_file_actions_adddup2(actions, program.output.get(), STDOUT_FILENO);
    else
        posix_spawn_file_actions_addopen(actions, STDOUT_FILENO, "/dev/null", O_WRONLY, 0);
    posix_spawn_file_actions_adddup2(actions, STDOUT_FILENO, STDERR_FILENO);
    int firstClosed = STDERR_FILENO + 1;
    if (program.inherited >= 0)
        posix_spawn_file_actions_adddup2(actions, program.inherited, firstClosed++);
    posix_spawn_file_actions_addclosefrom_np(actions, firstClosed);
    posix_spawn_file_actions_addchdir_np(actions, "/");

    std::vector<std::string> words = program.words;
    std::vector<std::string> environment = environmentWith(program.environment);
    pid_t id = 0;
    const int error = posix_spawn(&id, words.front().c_str(), actions, &settings.attributes, pointersTo(words).data(),
                                  pointersTo(environment).data());
    if (error != 0)
        throw Error("cannot start " + words.front() + ": " + reasonOf(error));
    return Process(id);
}

std::optional<std::string> endOfChild(const Process& child) {
    int status = 0;
    if (waitpid(child.id(), &status, WNOHANG) != child.id())
        return std::nullopt;
    return WIFSIGNALED(status) ? endBySignal(WTERMSIG(status)) : endWithStatus(WEXITSTATUS(status));
}

std::string endWithStatus(int status) {
    return "with status " + std::to_string(status);
}

std::string endBySignal(int signal) {
    return "by signal " + std::to_string(signal) + " (" + strsignal(signal) + ")";
}

}  // namespace device
