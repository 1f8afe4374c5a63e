#include "TextPicture.h"

#include <device/Device.h>

#include <algorithm>
#include <exception>
#include <filesystem>
#include <set>
#include <string>

namespace efl_answers {
namespace {

constexpr char scheme[] = "file:/";
constexpr std::size_t schemeLength = sizeof(scheme) - 1;
/// No picture inside a text is larger; a file that says it is would only take memory.
constexpr int largestSide = 2048;
/// Texts are set anew again and again, and a broken one may have any number of pictures.
constexpr std::size_t mostLines = 100;

void logOnce(const std::string& path, const std::string& why) {
    static std::set<std::string> logged;
    if (logged.size() < mostLines && logged.insert(path).second)
        device::Device::current().log().write(device::Log::Level::Error, "EFL",
                                              path + ": error: " + why + "; its place in the text stays empty");
}

/// Why the picture cannot be shown; "" when `image` has it.
std::string load(Evas_Object* image, const std::string& path) {
    std::error_code error;
    const auto status = std::filesystem::status(path, error);
    if (error)
        return error.message();
    if (!std::filesystem::is_regular_file(status))
        return "is not a regular file";
    evas_object_image_file_set(image, path.c_str(), nullptr);
    const Evas_Load_Error failure = evas_object_image_load_error_get(image);
    if (failure != EVAS_LOAD_ERROR_NONE)
        return evas_load_error_str(failure);
    int width = 0;
    int height = 0;
    evas_object_image_size_get(image, &width, &height);
    if (width <= largestSide && height <= largestSide)
        return "";
    evas_object_image_file_set(image, nullptr, nullptr);
    return std::to_string(width) + "x" + std::to_string(height) + " pixels are too many inside a text";
}

}  // namespace

Evas_Object* emptyPicture(Evas* canvas) noexcept {
    Evas_Object* rectangle = evas_object_rectangle_add(canvas);
    evas_object_color_set(rectangle, 0, 0, 0, 0);
    return rectangle;
}

Evas_Object* textPicture(Evas* canvas, const char* href) noexcept {
    try {
        const std::string item = href ? href : "";
        if (item.rfind(scheme, 0) != 0)
            return nullptr;
        const std::string path = "/" + item.substr(std::min(item.size(), item.find_first_not_of('/', schemeLength)));
        Evas_Object* image = evas_object_image_filled_add(canvas);
        const std::string failure = load(image, path);
        if (failure.empty())
            return image;
        evas_object_del(image);
        logOnce(path, failure);
        return emptyPicture(canvas);
    } catch (const std::exception&) {
        return emptyPicture(canvas);
    }
}

}  // namespace efl_answers
