#include "TestDevice.h"

#include <gtest/gtest.h>

#include <chrono>
#include <csignal>
#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

namespace test_tool {

namespace {

namespace fs = std::filesystem;
using namespace std::chrono_literals;

constexpr char errorPrefix[] = "kest-device: error: ";

/// Passed on to the runs: where programs lie, and how sanitizers report.
constexpr const char* passedOn[] = {"PATH", "TMPDIR", "ASAN_OPTIONS", "UBSAN_OPTIONS", "LSAN_OPTIONS"};

int waitFor(pid_t process) {
    int status = 0;
    waitpid(process, &status, 0);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -WTERMSIG(status);
}

bool isNumber(const std::string& text) {
    return text.find_first_not_of("0123456789") == std::string::npos;
}

bool waitUntil(const std::function<bool()>& condition) {
    for (int i = 0; i < 1000; ++i) {
        if (condition()) {
            return true;
        }
        std::this_thread::sleep_for(10ms);
    }
    return false;
}

/// Empty for a process that has ended meanwhile.
std::string readOfProcess(const fs::path& file) {
    try {
        return support::readFile(file);
    } catch (const std::ios_base::failure&) {
        return "";
    }
}

std::vector<std::string> kestDevice(const std::vector<std::string>& words) {
    std::vector<std::string> command{KEST_DEVICE_PROGRAM};
    command.insert(command.end(), words.begin(), words.end());
    return command;
}

/// Not one that has ended and only waits for its parent to notice.
bool runs(const fs::path& process) {
    const std::string stat = readOfProcess(process / "stat");
    const std::size_t state = stat.rfind(") ");
    return state != std::string::npos && stat[state + 2] != 'Z';
}

}  // namespace

std::ostream& operator<<(std::ostream& stream, const Result& result) {
    return stream << "status " << result.status << "\nout: " << result.out << "\nerr: " << result.err;
}

Result done(const std::string& out) {
    return {0, out, ""};
}
Result failed(const std::string& message) {
    return {1, "", errorPrefix + message + "\n"};
}
Result wrongUsage(const std::string& message) {
    return {2, "", errorPrefix + message + "\n"};
}

BackgroundRun::~BackgroundRun() {
    kill(process_, SIGTERM);
    waitFor(process_);
}

bool BackgroundRun::outBecomes(const std::string& text) const {
    return waitUntil([&] { return out() == text; });
}

TestDevice::TestDevice() : root_(folder_.path() / "device") {
    const fs::path home = folder_.path() / "home";
    fs::create_directory(home);
    for (const char* name : passedOn) {
        if (const char* value = std::getenv(name)) {
            environment_[name] = value;
        }
    }
    environment_["HOME"] = home;
    environment_["LANG"] = "C.UTF-8";
    environment_["KEST_DEVICE"] = root_;
}

TestDevice::~TestDevice() {
    if (fs::exists(root_)) {
        run({"stop"});
    }
    for (const pid_t process : processes()) {
        kill(process, SIGKILL);
        waitUntil([&] { return !runs(fs::path("/proc") / std::to_string(process)); });
    }
}

void TestDevice::setEnvironment(const std::string& name, const std::optional<std::string>& value) {
    value ? void(environment_[name] = *value) : void(environment_.erase(name));
}

void TestDevice::setRoot(const fs::path& root) {
    root_ = folder() / root;
    environment_["KEST_DEVICE"] = root_;
}

pid_t TestDevice::spawn(const std::vector<std::string>& command, const fs::path& out, const fs::path& err) {
    std::vector<std::string> all = command;
    std::vector<char*> arguments;
    for (std::string& word : all) {
        arguments.push_back(word.data());
    }
    arguments.push_back(nullptr);
    std::vector<std::string> variables;
    for (const auto& [name, value] : environment_) {
        variables.push_back(name + "=" + value);
    }
    std::vector<char*> environment;
    for (std::string& variable : variables) {
        environment.push_back(variable.data());
    }
    environment.push_back(nullptr);

    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_addopen(&actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
    posix_spawn_file_actions_addopen(&actions, STDOUT_FILENO, out.c_str(), O_WRONLY | O_CREAT, 0600);
    posix_spawn_file_actions_addopen(&actions, STDERR_FILENO, err.c_str(), O_WRONLY | O_CREAT, 0600);
    posix_spawn_file_actions_addchdir_np(&actions, folder().c_str());
    pid_t process = 0;
    const int error = posix_spawnp(&process, arguments[0], &actions, nullptr, arguments.data(), environment.data());
    posix_spawn_file_actions_destroy(&actions);
    if (error != 0) {
        throw std::runtime_error("cannot run " + command.front());
    }
    return process;
}

Result TestDevice::run(const std::vector<std::string>& words) {
    return runCommand(kestDevice(words));
}

Result TestDevice::runTraced(const std::vector<std::string>& words, const fs::path& trace) {
    // The leak check of a sanitizer traces the process itself, and two cannot.
    const auto before = environment_;
    environment_["ASAN_OPTIONS"] += ":detect_leaks=0";
    std::vector<std::string> command{"strace", "-D", "-f", "-e", "trace=open,openat", "-o", trace.string()};
    const std::vector<std::string> traced = kestDevice(words);
    command.insert(command.end(), traced.begin(), traced.end());
    const Result result = runCommand(command);
    environment_ = before;
    return result;
}

Result TestDevice::runCommand(const std::vector<std::string>& command) {
    const fs::path out = folder() / ("out." + std::to_string(++runs_));
    const fs::path err = folder() / ("err." + std::to_string(runs_));
    Result result;
    result.status = waitFor(spawn(command, out, err));
    result.out = support::readFile(out);
    result.err = support::readFile(err);
    fs::remove(out);
    fs::remove(err);
    return result;
}

Result TestDevice::runUnread(const std::vector<std::string>& words) {
    std::vector<std::string> command{"bash", "-c", R"(set -o pipefail; "$@" | true)", "bash"};
    for (const std::string& word : kestDevice(words)) {
        command.push_back(word);
    }
    return runCommand(command);
}

std::string TestDevice::must(const std::vector<std::string>& words) {
    const Result result = run(words);
    EXPECT_EQ(result.status, 0) << words.front() << ": " << result.err;
    return result.out;
}

nlohmann::json TestDevice::json(const std::vector<std::string>& words) {
    std::vector<std::string> all = words;
    all.push_back("--json");
    return nlohmann::json::parse(must(all), nullptr, false);
}

BackgroundRun TestDevice::runInBackground(const std::vector<std::string>& words) {
    const fs::path out = folder() / ("out." + std::to_string(++runs_));
    return BackgroundRun(spawn(kestDevice(words), out, folder() / ("err." + std::to_string(runs_))), out);
}

device::Device TestDevice::open() const {
    device::Device::Options options = device::Device::Options::standard();
    options.folder = device::Folder(root_);
    return device::Device(std::move(options));
}

std::vector<pid_t> TestDevice::processes() const {
    std::vector<pid_t> found;
    const std::string marks[] = {"KEST_DEVICE=" + root_.string() + '\0', "--address=unix:path=" + root_.string()};
    for (const fs::directory_entry& entry : fs::directory_iterator("/proc")) {
        const std::string name = entry.path().filename();
        if (!isNumber(name) || name == std::to_string(getpid()) || !runs(entry.path())) {
            continue;
        }
        const bool ours = readOfProcess(entry.path() / "environ").find(marks[0]) != std::string::npos ||
                          readOfProcess(entry.path() / "cmdline").find(marks[1]) != std::string::npos;
        if (ours) {
            found.push_back(std::stoi(name));
        }
    }
    return found;
}

pid_t TestDevice::application() {
    const nlohmann::json applications = json({"status"})["applications"];
    return applications.size() == 1 ? applications[0]["process"].get<pid_t>() : 0;
}

fs::path makePackage(const fs::path& where, const std::string& id, const std::string& version) {
    fs::create_directories(where / "shared/res");
    support::writeFile(where / "tizen-manifest.xml",
                       "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                       "<manifest xmlns=\"http://tizen.org/ns/packages\" api-version=\"2.4\" package=\"" +
                           id + "\" version=\"" + version + "\">\n    <ui-application appid=\"" + id +
                           "\" exec=\"app\" type=\"capp\">\n        <label>Label of " + id +
                           "</label>\n    </ui-application>\n</manifest>\n");
    return where;
}

}  // namespace test_tool
