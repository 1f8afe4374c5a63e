#include "RealDesktop.h"

#include "device/Bus.h"
#include "device/BusName.h"
#include "support/Environment.h"

#include <array>
#include <cstdlib>
#include <fcntl.h>
#include <poll.h>
#include <stdexcept>
#include <unistd.h>

namespace {

using support::Environment;
using support::Process;

constexpr char daemonName[] = "org.freedesktop.Notifications";

bool isInstalled(const std::string& program) {
    std::string folders = std::getenv("PATH") ? std::getenv("PATH") : "";
    folders += ':';
    for (std::size_t begin = 0, end = 0; (end = folders.find(':', begin)) != std::string::npos; begin = end + 1)
        if (access((folders.substr(begin, end - begin) + "/" + program).c_str(), X_OK) == 0)
            return true;
    return false;
}

/// A click means what it means for other daemons without being told.
constexpr char settings[] = "[global]\n"
                            "mouse_left_click = do_action, close_current\n"
                            "[urgency_normal]\n"
                            "timeout = 0\n";

}  // namespace

std::optional<std::string> RealDesktop::missing() {
    for (const char* program : {"Xvfb", "openbox", "dunst", "xdotool"})
        if (!isInstalled(program))
            return program;
    return std::nullopt;
}

RealDesktop::RealDesktop() : display_(startServer()) {
    const std::string file = (folder_.path() / "dunstrc").string();
    support::writeFile(file, settings);
    const Environment display("DISPLAY", display_);
    const Environment home("HOME", folder_.path().string());
    windowManager_.emplace(Process::ofProgram({"openbox", "--sm-disable"}));
    daemon_.emplace(Process::ofProgram({"dunst", "-config", file}));
    const device::Folder folder(folder_.path());
    const std::unique_ptr<device::Bus> bus = device::Bus::connect(folder);
    for (int attempt = 0; attempt < 2000 && !device::BusName::owner(*bus, daemonName); ++attempt)
        poll(nullptr, 0, 5);
    if (!device::BusName::owner(*bus, daemonName))
        throw std::runtime_error("dunst does not come up on " + display_);
}

RealDesktop::~RealDesktop() {
    for (auto* process : {&daemon_, &windowManager_})
        if (*process)
            (*process)->end(SIGTERM);
    // One that is killed leaves its socket and its lock behind.
    if (server_)
        server_->end(SIGTERM);
}

/// The server takes the first number that is free, and tells it.
std::string RealDesktop::startServer() {
    std::array<int, 2> ends{};
    if (pipe2(ends.data(), O_CLOEXEC) != 0)
        throw std::runtime_error("cannot make a pipe");
    server_.emplace(Process::ofWork([&] {
        const int null = open("/dev/null", O_RDWR);
        dup2(null, STDOUT_FILENO);
        dup2(null, STDERR_FILENO);
        const int number = dup(ends[1]);
        execlp("Xvfb", "Xvfb", "-displayfd", std::to_string(number).c_str(), "-screen", "0", "1000x1400x24",
               "-nolisten", "tcp", nullptr);
        return 127;
    }));
    close(ends[1]);
    std::string number;
    char digit = 0;
    pollfd readable{ends[0], POLLIN, 0};
    while (poll(&readable, 1, 10000) > 0 && read(ends[0], &digit, 1) == 1 && digit != '\n')
        number += digit;
    close(ends[0]);
    if (number.empty())
        throw std::runtime_error("Xvfb does not come up");
    return ":" + number;
}

bool RealDesktop::xdotool(const std::vector<std::string>& words) const {
    const Environment display("DISPLAY", display_);
    std::vector<std::string> command{"timeout", "10", "xdotool"};
    command.insert(command.end(), words.begin(), words.end());
    return Process::ofProgram(command).wait() == 0;
}

bool RealDesktop::showsWindow(const std::string& windowClass) const {
    return xdotool({"search", "--sync", "--onlyvisible", "--class", windowClass});
}

void RealDesktop::clickWindow(const std::string& windowClass) const {
    if (!xdotool({"search", "--sync", "--onlyvisible", "--class", windowClass, "mousemove", "--window", "%1", "60",
                  "20", "click", "1"}))
        throw std::runtime_error("xdotool finds no window " + windowClass);
}
