#pragma once

#include "device/ApplicationLock.h"
#include "device/Folder.h"
#include "support/Process.h"

#include <stdexcept>
#include <string>

/// An application's lock that another process holds while this lives.
class HeldApplicationLock {
public:
    HeldApplicationLock(const device::Folder& folder, const std::string& appId)
        : process_(support::Process::ofWork([&] {
              const device::ApplicationLock lock(folder, appId);
              [[maybe_unused]] const auto written = write(pipe_.writing, "!", 1);
              pause();
              return 0;
          })) {
        char byte = 0;
        [[maybe_unused]] const auto got = read(pipe_.reading, &byte, 1);
    }
    pid_t process() const { return process_.id(); }

private:
    struct Pipe {
        Pipe() {
            int ends[2];
            if (pipe(ends) != 0)
                throw std::runtime_error("no pipe");
            reading = ends[0];
            writing = ends[1];
        }
        ~Pipe() {
            close(reading);
            close(writing);
        }
        Pipe(const Pipe&) = delete;
        Pipe& operator=(const Pipe&) = delete;
        int reading;
        int writing;
    };
    Pipe pipe_;
    support::Process process_;
};
