#include "RegularFile.h"

#include "TableFile.h"

#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace uxt {
namespace {

constexpr std::size_t sizeLimit = 1 << 20;

class Descriptor {
public:
    explicit Descriptor(int number) : number_(number) {}
    ~Descriptor() {
        if (number_ >= 0)
            ::close(number_);
    }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;

    int number() const { return number_; }

private:
    int number_;
};

}  // namespace

std::string readRegularFile(const std::string& file) {
    // O_NONBLOCK: opening a pipe that nobody writes to would wait for ever.
    const Descriptor descriptor(::open(file.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    struct stat status = {};
    if (descriptor.number() < 0 || ::fstat(descriptor.number(), &status) != 0)
        throw TableError(file, std::string("cannot be opened: ") + std::strerror(errno));
    if (!S_ISREG(status.st_mode))
        throw TableError(file, "is not a regular file");

    std::string text(sizeLimit + 1, '\0');
    std::size_t length = 0;
    while (length < text.size()) {
        const ssize_t count = ::read(descriptor.number(), text.data() + length, text.size() - length);
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            throw TableError(file, std::string("cannot be read: ") + std::strerror(errno));
        if (count == 0)
            break;
        length += static_cast<std::size_t>(count);
    }
    if (length > sizeLimit)
        throw TableError(file, "is larger than 1 MiB");
    text.resize(length);
    return text;
}

}  // namespace uxt
