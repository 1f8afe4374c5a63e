#pragma once

#include <filesystem>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace catalogue {

/// A text and the line that it begins on, for messages.
struct Line {
    std::string text;
    long number = 0;
};

struct Attachment {
    std::string id;
    Line markup;
};

/// One tip as its detail file tells it.
struct Detail {
    std::string file;  ///< as messages name it
    Line titleId;
    std::string title;
    Line appNameId;
    Line image;
    Line launchAppid;
    Line contents;
    std::vector<Attachment> attachments;
};

struct String {
    std::string region;
    std::string id;
    std::string value;
    long line = 0;
};

/// The string file of one tip, in file order.
struct StringFile {
    std::string file;  ///< as messages name it
    std::vector<String> strings;
};

/// One "menu" of the main menu file and the files that it leads to.
struct Tip {
    std::string path;
    std::string appid;
    std::string state;
    long line = 0;                          ///< in the main menu file
    bool everywhere = true;                 ///< false: its application has to be installed first
    std::filesystem::path sharedResources;  ///< of its application
    Detail detail;
    StringFile strings;
};

Detail readDetail(const std::string& text, const std::string& name);
StringFile readStrings(const std::string& text, const std::string& name);

/// The catalogue that lies in the project's folder: the application's own tips, those of the packages that every device
/// has, and those of the example packages. Throws std::runtime_error for a file that is missing or not well formed.
std::vector<Tip> readCatalogue(const std::filesystem::path& project);

/// The folders of all packages beside the application itself, by id.
std::map<std::string, std::filesystem::path> packages(const std::filesystem::path& project);

}  // namespace catalogue
