#include "device/Folder.h"

#include "Files.h"
#include "Utf8.h"
#include "device/Error.h"

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <string>
#include <string_view>
#include <sys/stat.h>
#include <unistd.h>

namespace device {
namespace {

std::string environment(const char* name) {
    const char* value = std::getenv(name);
    return value ? value : "";
}

bool markupCannotCarry(char character) {
    const auto byte = static_cast<unsigned char>(character);
    return byte <= ' ' || byte == 0x7f || std::string_view("<>&\"'").find(character) != std::string_view::npos;
}

/// The path with everything that would break a line of text made visible.
std::string printable(const std::string& path) {
    std::string text;
    for (const char character : path) {
        const auto byte = static_cast<unsigned char>(character);
        text += byte < ' ' || byte >= 0x7f ? '?' : character;
    }
    return text;
}

std::filesystem::path resolved(const std::filesystem::path& root) {
    std::error_code error;
    std::filesystem::path path = std::filesystem::weakly_canonical(std::filesystem::absolute(root), error);
    if (error)
        path = std::filesystem::absolute(root).lexically_normal();
    return path.has_filename() ? path : path.parent_path();
}

}  // namespace

Folder Folder::resolve() {
    if (const std::string named = environment("KEST_DEVICE"); !named.empty())
        return Folder(named);
    if (const std::filesystem::path state = environment("XDG_STATE_HOME"); state.is_absolute())
        return Folder(state / DEVICE_FOLDER_NAME);
    if (const std::filesystem::path home = environment("HOME"); home.is_absolute())
        return Folder(home / ".local/state" / DEVICE_FOLDER_NAME);
    throw Error("no folder for the device: none of KEST_DEVICE, XDG_STATE_HOME and HOME is set; set KEST_DEVICE");
}

Folder::Folder(const std::filesystem::path& root) : root_(resolved(root)) {
    const std::string text = root_.string();
    if (std::any_of(text.begin(), text.end(), markupCannotCarry))
        throw Error("the device's folder \"" + printable(text) +
                    "\" holds a blank or another character that markup cannot carry (control characters and "
                    "<>&\"'); choose another folder with KEST_DEVICE");
    if (!isUtf8(text))
        throw Error("the device's folder \"" + printable(text) +
                    "\" is not UTF-8; choose another folder with KEST_DEVICE");
}

void Folder::create() const {
    const auto fail = [this](const std::string& why) {
        throw Error(root_.string() + ": " + why +
                    "; give the device another folder with KEST_DEVICE, or make this one writable");
    };
    std::error_code error;
    std::filesystem::create_directories(root_.parent_path(), error);
    if (error)
        fail("the device's folder cannot be made: " + error.message());
    if (mkdir(root_.c_str(), 0700) != 0 && errno != EEXIST)
        fail("the device's folder cannot be made: " + reasonOf(errno));
    if (!std::filesystem::is_directory(root_, error))
        fail("the device's folder cannot be made: a file stands in its place");
    if (access(root_.c_str(), R_OK | W_OK | X_OK) != 0)
        fail("the device's folder cannot be written: " + reasonOf(errno));
}

}  // namespace device
