#pragma once

#include <cstdint>
#include <filesystem>
#include <optional>
#include <vector>

namespace catalogue {

/// A picture in memory, line by line from the top.
struct Bitmap {
    std::size_t width = 0;
    std::size_t height = 0;
    std::vector<std::uint32_t> pixels;  ///< 0xAARRGGBB, colour not multiplied by alpha

    /// `columns` x `lines` of one colour.
    Bitmap(std::size_t columns, std::size_t lines, std::uint32_t colour)
        : width(columns), height(lines), pixels(columns * lines, colour) {}

    std::uint32_t& at(std::size_t x, std::size_t y) { return pixels[y * width + x]; }
    std::uint32_t at(std::size_t x, std::size_t y) const { return pixels[y * width + x]; }
};

/// nullopt for what is missing or no whole PNG.
std::optional<Bitmap> readPng(const std::filesystem::path& file);

/// Writes it with its parent folders. Throws std::runtime_error when that fails.
void writePng(const std::filesystem::path& file, const Bitmap& bitmap);

}  // namespace catalogue
