#pragma once

#include <csignal>
#include <fcntl.h>
#include <functional>
#include <stdexcept>
#include <string>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>
#include <utility>
#include <vector>

namespace support {

/// A child process of the test, which ends with the test at the latest.
class Process {
public:
    /// Starts a program, found on the path, with /dev/null for input, output and standard error.
    static Process ofProgram(const std::vector<std::string>& command) {
        std::vector<char*> arguments;
        arguments.reserve(command.size() + 1);
        for (const std::string& word : command)
            arguments.push_back(const_cast<char*>(word.c_str()));
        arguments.push_back(nullptr);
        return ofWork([&arguments] {
            const int null = open("/dev/null", O_RDWR);
            dup2(null, STDIN_FILENO);
            dup2(null, STDOUT_FILENO);
            dup2(null, STDERR_FILENO);
            execvp(arguments[0], arguments.data());
            return 127;
        });
    }
    /// Forks; `work` runs in the child, which ends with what it returns (99 after an exception). SQLite and bus
    /// connections must not be carried into it: open the device there, not before.
    static Process ofWork(const std::function<int()>& work) {
        const pid_t parent = getpid();
        const pid_t id = fork();
        if (id < 0)
            throw std::runtime_error("cannot start a process");
        if (id == 0) {
            prctl(PR_SET_PDEATHSIG, SIGKILL);
            if (getppid() != parent)
                _exit(98);
            int status = 99;
            try {
                status = work();
            } catch (...) {
                status = 99;
            }
            _exit(status);
        }
        return Process(id);
    }

    Process(Process&& other) noexcept : id_(std::exchange(other.id_, 0)) {}
    Process& operator=(Process&&) = delete;
    ~Process() { end(SIGKILL); }

    pid_t id() const { return id_; }
    void signal(int number) const { kill(id_, number); }
    /// Sends the signal and waits for the end.
    void end(int signalNumber) {
        if (id_ <= 0)
            return;
        kill(id_, signalNumber);
        waitpid(std::exchange(id_, 0), nullptr, 0);
    }
    /// Waits for the end: the exit status, or the negative number of the signal that ended it. Throws when somebody
    /// else has waited for it, as Ecore's handler of SIGCHLD does (see runLoopUntil() in PrivateBus.h).
    int wait() {
        int status = 0;
        if (waitpid(std::exchange(id_, 0), &status, 0) < 0)
            throw std::runtime_error("the end of a child process was taken by somebody else");
        return WIFEXITED(status) ? WEXITSTATUS(status) : -WTERMSIG(status);
    }

private:
    explicit Process(pid_t id) : id_(id) {}
    pid_t id_;
};

}  // namespace support
