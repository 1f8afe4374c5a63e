#include "SourceTree.h"

#include <algorithm>
#include <fstream>
#include <iterator>
#include <set>
#include <sstream>
#include <stdexcept>

namespace architecture {

SourceFile sourceFile(std::string path, std::string_view text) {
    SourceFile file{std::move(path), {}};
    std::istringstream stream{std::string(text)};
    for (std::string line; std::getline(stream, line);) {
        file.lines.push_back(line);
    }
    return file;
}

SourceTree readTree(const std::filesystem::path& root, const std::vector<std::string>& folders) {
    static const std::set<std::string> kinds = {".cpp", ".h", ".edc", ".po", ".txt", ".xml"};
    SourceTree tree;
    for (const std::string& folder : folders) {
        for (const auto& entry : std::filesystem::recursive_directory_iterator(root / folder)) {
            if (!entry.is_regular_file() || kinds.count(entry.path().extension().string()) == 0) {
                continue;
            }
            std::ifstream stream(entry.path());
            if (!stream) {
                throw std::runtime_error(entry.path().string() + " cannot be read");
            }
            const std::string text{std::istreambuf_iterator<char>(stream), {}};
            tree.push_back(sourceFile(std::filesystem::relative(entry.path(), root).generic_string(), text));
        }
    }
    std::sort(tree.begin(), tree.end(), [](const auto& a, const auto& b) { return a.path < b.path; });
    return tree;
}

}  // namespace architecture
