#pragma once

#include "device/Descriptor.h"

#include <chrono>
#include <filesystem>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace device {

/// A process of this machine, by its id.
class Process {
public:
    explicit Process(int id) : id_(id) {}

    int id() const { return id_; }
    /// False as soon as it has ended, also while its parent has not noticed yet.
    bool runs() const;
    /// Its words, the program's name first; empty when they cannot be told.
    std::vector<std::string> arguments() const;
    /// A variable of the environment that it was started with; nullopt when it had none, or cannot be asked.
    std::optional<std::string> variable(const std::string& name) const;

    /// Whether it ended within that time.
    bool endsWithin(std::chrono::milliseconds time) const;
    /// Asks it to end, and after a while makes it end. Throws Error when it goes on nevertheless.
    void end() const;

private:
    int id_;
};

/// What to start, and how it stands towards its surroundings. Nothing of it passes through a shell.
struct Program {
    std::vector<std::string> words;  ///< absolute path of the executable, then its arguments
    Descriptor output;               ///< takes its standard output and error; none: they are dropped
    std::vector<std::pair<std::string, std::string>> environment;  ///< set beside what this process has
    int inherited = -1;  ///< a file of this process that it gets as descriptor 3; -1 for none
};

/// Starts a program in a session of its own, in the folder "/", with no standard input, with no other open file than
/// the ones above, and with every signal as a fresh process has it. Waits no longer than until the program is loaded.
/// Throws Error that names the program when it cannot be started.
Process startDetached(const Program& program);

/// How a child of this process ended (as the two below say it), or nullopt while it runs.
std::optional<std::string> endOfChild(const Process& child);
/// "with status 1"
std::string endWithStatus(int status);
/// "by signal 11 (Segmentation fault)"
std::string endBySignal(int signal);

}  // namespace device
