#include "Png.h"

#include <bit>
#include <png.h>
#include <stdexcept>

namespace catalogue {
namespace {

static_assert(std::endian::native == std::endian::little, "libpng's BGRA is 0xAARRGGBB only there");

/// libpng's own memory of a picture, freed on every way out.
struct Image : png_image {
    Image() : png_image{} {
        version = PNG_IMAGE_VERSION;
        format = PNG_FORMAT_BGRA;
    }
    ~Image() { png_image_free(this); }
    Image(const Image&) = delete;
    Image& operator=(const Image&) = delete;
};

}  // namespace

std::optional<Bitmap> readPng(const std::filesystem::path& file) {
    Image image;
    if (!png_image_begin_read_from_file(&image, file.c_str()))
        return std::nullopt;
    image.format = PNG_FORMAT_BGRA;
    Bitmap bitmap(image.width, image.height, 0);
    if (!png_image_finish_read(&image, nullptr, bitmap.pixels.data(), 0, nullptr))
        return std::nullopt;
    return bitmap;
}

void writePng(const std::filesystem::path& file, const Bitmap& bitmap) {
    std::filesystem::create_directories(file.parent_path());
    Image image;
    image.width = static_cast<png_uint_32>(bitmap.width);
    image.height = static_cast<png_uint_32>(bitmap.height);
    image.flags = PNG_IMAGE_FLAG_FAST;
    if (!png_image_write_to_file(&image, file.c_str(), 0, bitmap.pixels.data(), 0, nullptr))
        throw std::runtime_error("cannot write " + file.string());
}

}  // namespace catalogue
