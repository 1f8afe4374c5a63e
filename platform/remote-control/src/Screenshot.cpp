#include "Screenshot.h"

#include "device/Error.h"

#include <array>
#include <cerrno>
#include <cstring>
#include <fstream>
#include <memory>
#include <string>
#include <unistd.h>

namespace remote_control {

namespace {

namespace fs = std::filesystem;

struct ObjectDelete {
    void operator()(Evas_Object* object) const { evas_object_del(object); }
};
using Object = std::unique_ptr<Evas_Object, ObjectDelete>;

/// An image that shows what lies beneath it; it works on every engine, and whatever covers the window.
Object snapshotOf(Evas_Object* window) {
    Evas* canvas = evas_object_evas_get(window);
    int width = 0;
    int height = 0;
    evas_output_size_get(canvas, &width, &height);
    Object snapshot(evas_object_image_filled_add(canvas));
    evas_object_image_snapshot_set(snapshot.get(), EINA_TRUE);
    evas_object_image_size_set(snapshot.get(), width, height);
    evas_object_geometry_set(snapshot.get(), 0, 0, width, height);
    evas_object_layer_set(snapshot.get(), EVAS_LAYER_MAX);
    evas_object_pass_events_set(snapshot.get(), EINA_TRUE);
    evas_object_show(snapshot.get());
    // Waits for the frame, also for one that a thread draws at this moment; the window's own drawing does not.
    evas_render(canvas);
    return snapshot;
}

/// EFL's writer does not notice a full disk, so the file itself is asked: a PNG ends with an IEND chunk.
bool endsAsPng(const fs::path& file) {
    static constexpr std::array<char, 8> ending{'I', 'E', 'N', 'D', '\xAE', '\x42', '\x60', '\x82'};
    std::array<char, 8> bytes{};
    std::ifstream stream(file, std::ios::binary);
    stream.seekg(-static_cast<std::streamoff>(bytes.size()), std::ios::end);
    return stream.read(bytes.data(), bytes.size()) && bytes == ending;
}

[[noreturn]] void fail(const fs::path& file, const std::string& why) {
    throw device::Error("cannot write the picture " + file.string() + ": " + why);
}

void requireWritable(const fs::path& file) {
    if (!file.is_absolute()) {
        fail(file, "its path must be absolute");
    }
    if (file.extension() != ".png") {
        fail(file, "its name must end in .png");
    }
    std::error_code error;
    if (!fs::is_directory(file.parent_path(), error)) {
        fail(file, file.parent_path().string() + " is no folder");
    }
    if (fs::is_directory(file, error)) {
        fail(file, "it is a folder");
    }
    if (access(file.parent_path().c_str(), W_OK) != 0) {
        fail(file, std::strerror(errno));
    }
}

}  // namespace

void writeScreenshot(Evas_Object* window, const fs::path& file) {
    requireWritable(file);
    const fs::path draft = file.parent_path() / ("." + file.stem().string() + "." + std::to_string(getpid()) + ".png");
    const Object snapshot = snapshotOf(window);
    std::error_code error;
    const bool saved = evas_object_image_save(snapshot.get(), draft.c_str(), nullptr, nullptr) && endsAsPng(draft);
    if (saved) {
        fs::rename(draft, file, error);
    }
    if (!saved || error) {
        std::error_code ignored;
        fs::remove(draft, ignored);
        fail(file, error ? error.message() : "is the disk full?");
    }
}

}  // namespace remote_control
