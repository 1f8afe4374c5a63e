#include "Pages.h"

#include <nlohmann/json.hpp>

#include <fstream>
#include <stdexcept>

namespace bench {

NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(Picture, file, marker)
NLOHMANN_DEFINE_TYPE_NON_INTRUSIVE(Page, icon, title, text, pictures, height)

void writePages(const std::filesystem::path& file, const std::vector<Page>& pages) {
    std::ofstream stream(file);
    stream << nlohmann::json(pages);
    if (!stream.flush()) {
        throw std::runtime_error(file.string() + ": cannot be written");
    }
}

std::vector<Page> readPages(const std::filesystem::path& file) {
    std::ifstream stream(file);
    std::vector<Page> pages;
    try {
        pages = nlohmann::json::parse(stream).get<std::vector<Page>>();
    } catch (const nlohmann::json::exception& failure) {
        throw std::runtime_error(file.string() + ": " + failure.what());
    }
    if (pages.empty()) {
        throw std::runtime_error(file.string() + ": no pages");
    }
    return pages;
}

}  // namespace bench
