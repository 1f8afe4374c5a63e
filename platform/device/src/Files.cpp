#include "Files.h"

#include "device/Error.h"

#include <cerrno>
#include <fcntl.h>
#include <poll.h>
#include <sys/file.h>
#include <system_error>
#include <unistd.h>

namespace device {

Descriptor::~Descriptor() {
    if (number_ >= 0)
        close(number_);
}

Descriptor& Descriptor::operator=(Descriptor&& other) noexcept {
    Descriptor old(number_);
    number_ = other.release();
    return *this;
}

int Descriptor::release() noexcept {
    const int number = number_;
    number_ = -1;
    return number;
}

FileLock::FileLock(const std::filesystem::path& file, std::chrono::milliseconds patience)
    : file_(open(file.c_str(), O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW, 0600)) {
    if (!file_)
        throw Error(file.string() + ": cannot be made: " + reasonOf(errno) +
                    "; make its folder one that this user can write");
    const auto end = std::chrono::steady_clock::now() + patience;
    while (flock(file_.get(), LOCK_EX | LOCK_NB) != 0) {
        if (errno != EWOULDBLOCK && errno != EINTR)
            throw Error(file.string() + ": cannot be locked: " + reasonOf(errno) +
                        "; put the device on another file system");
        if (std::chrono::steady_clock::now() >= end)
            throw Error(file.string() + ": is held by another process; end that process and try again");
        poll(nullptr, 0, 5);
    }
}

std::string reasonOf(int error) {
    return std::generic_category().message(error);
}

}  // namespace device
