#pragma once

#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

namespace architecture {

/** A text file of the project. */
struct SourceFile {
    /** From the project's root, with slashes. */
    std::string path;
    std::vector<std::string> lines;
};

/** The files that the rules look at; made from a folder, or by a test from texts. */
using SourceTree = std::vector<SourceFile>;

/** A file of that path and text. */
SourceFile sourceFile(std::string path, std::string_view text);

/** The text files in `folders` of the project in `root`, in the order of their paths. */
SourceTree readTree(const std::filesystem::path& root, const std::vector<std::string>& folders);

}  // namespace architecture
