#include "Pages.h"

#include <algorithm>
#include <fstream>
#include <stdexcept>

namespace bench {
namespace {

// One line each: a word that says what follows, and the rest.
constexpr char iconWord[] = "icon ";
constexpr char titleWord[] = "title ";
constexpr char textWord[] = "text ";
constexpr char heightWord[] = "height ";
constexpr char pictureWord[] = "picture ";
constexpr char markerWord[] = "marker ";

std::string oneLine(std::string text) {
    std::replace(text.begin(), text.end(), '\n', ' ');
    return text;
}

/// Takes the rest of the line after that word.
bool take(const std::string& line, const std::string& word, std::string& rest) {
    if (line.rfind(word, 0) != 0) {
        return false;
    }
    rest = line.substr(word.size());
    return true;
}

}  // namespace

void writePages(const std::filesystem::path& file, const std::vector<Page>& pages) {
    std::ofstream stream(file);
    for (const Page& page : pages) {
        stream << iconWord << page.icon << '\n' << titleWord << oneLine(page.title) << '\n';
        stream << textWord << oneLine(page.text) << '\n' << heightWord << page.height << '\n';
        for (const Picture& picture : page.pictures) {
            stream << pictureWord << picture.file << '\n' << markerWord << picture.marker << '\n';
        }
    }
    if (!stream.flush()) {
        throw std::runtime_error(file.string() + ": cannot be written");
    }
}

std::vector<Page> readPages(const std::filesystem::path& file) {
    std::vector<Page> pages;
    std::ifstream stream(file);
    for (std::string line, rest; std::getline(stream, line);) {
        if (take(line, iconWord, rest)) {
            pages.push_back({rest, "", "", {}});
        } else if (pages.empty()) {
            break;
        } else if (take(line, pictureWord, rest)) {
            pages.back().pictures.push_back({rest, ""});
        } else if (take(line, markerWord, rest) && !pages.back().pictures.empty()) {
            pages.back().pictures.back().marker = rest;
        } else if (take(line, heightWord, rest)) {
            pages.back().height = std::stoi(rest);
        } else {
            static_cast<void>(take(line, titleWord, pages.back().title) || take(line, textWord, pages.back().text));
        }
    }
    if (pages.empty()) {
        throw std::runtime_error(file.string() + ": no pages");
    }
    return pages;
}

}  // namespace bench
