#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace bench {

/// A picture, and the one that lies on it with the finger's marker; "" for none.
struct Picture {
    std::string file;
    std::string marker;
};

/// What a page of the pager shows: a picture that stands still, one that is higher than the area, or several in turn.
struct Page {
    /// The height of the picture area, in pixels of the pictures.
    static constexpr int areaHeight = 655;

    std::string icon;
    std::string title;
    /// Markup, as an entry takes it.
    std::string text;
    std::vector<Picture> pictures;
    /// Of the first picture.
    int height = 0;

    bool isTall() const { return pictures.size() == 1 && height > areaHeight; }
};

/// A file for a program that shows the same pages. Both throw std::runtime_error where the file cannot be used.
void writePages(const std::filesystem::path& file, const std::vector<Page>& pages);
std::vector<Page> readPages(const std::filesystem::path& file);

}  // namespace bench
