#include "Pictures.h"

#include "Png.h"

#include <algorithm>
#include <iterator>
#include <regex>
#include <set>

namespace catalogue {
namespace {

namespace fs = std::filesystem;

constexpr int picturesAtMost = 16;
constexpr std::size_t pageWidth = 716;
constexpr std::size_t pageHeight = 655;
// The page scrolls a picture that is more than 100 higher than itself, and cuts one that is a little too high.
constexpr std::size_t tallAtLeast = pageHeight + 101;
constexpr std::size_t tallAtMost = 1500;
constexpr std::uint32_t ground = 0xffdce8ec;

std::string nameOf(const Tip& tip) {
    return fs::path(tip.path).stem();
}

fs::path folderOf(const Tip& tip) {
    return tip.sharedResources / "contents/images";
}

std::vector<fs::path> filesIn(const fs::path& folder) {
    std::vector<fs::path> files;
    if (fs::exists(folder))
        std::copy(fs::directory_iterator(folder), fs::directory_iterator(), std::back_inserter(files));
    std::sort(files.begin(), files.end());
    return files;
}

/// Puts a file where it belongs; false when it is none of the tip's.
bool sortInto(Pictures& pictures, const Tip& tip, const fs::path& file) {
    static const std::regex form("(.*?)(_russia)?_([0-9]{2})(_touch)?\\.png");
    const std::string name = file.filename();
    std::smatch part;
    if (!std::regex_match(name, part, form) || part[1] != nameOf(tip))
        return false;
    Pictures::Files& files = part[4].matched ? (part[2].matched ? pictures.russianMarkers : pictures.markers)
                                             : (part[2].matched ? pictures.russian : pictures.shown);
    files.emplace(std::stoi(part[3]), file);
    return true;
}

bool hasEdge(const Bitmap& bitmap, std::uint32_t mask, std::uint32_t value) {
    const auto fits = [&](std::size_t x, std::size_t y) { return (bitmap.at(x, y) & mask) == value; };
    for (std::size_t x = 0; x < bitmap.width; ++x) {
        if (!fits(x, 0) || !fits(x, bitmap.height - 1))
            return false;
    }
    for (std::size_t y = 0; y < bitmap.height; ++y) {
        if (!fits(0, y) || !fits(bitmap.width - 1, y))
            return false;
    }
    return true;
}

/// What is wrong with one tip's pictures, each said of the line that names the first.
class Inspection {
public:
    explicit Inspection(const Tip& tip) : tip_(tip), pictures_(picturesOf(tip)) {}

    Problems problems() {
        checkSequence();
        checkVariants();
        for (const auto& [number, file] : pictures_.shown)
            checkPicture(file);
        for (const auto& [number, file] : pictures_.russian)
            checkPicture(file);
        for (const auto& [number, file] : pictures_.markers)
            checkMarker(file);
        return std::move(problems_);
    }

private:
    void say(const std::string& problem) {
        problems_.push_back(tip_.detail.file + ":" + std::to_string(tip_.detail.image.number) + ": " + problem);
    }
    void say(const fs::path& file, const std::string& problem) { say(file.filename().string() + " " + problem); }

    int count() const { return static_cast<int>(pictures_.shown.size()); }

    void checkSequence() {
        const std::string first = "contents/images/" + nameOf(tip_) + "_01.png";
        if (tip_.detail.image.text != first)
            say("the picture is called " + tip_.detail.image.text + ", not " + first);
        int expected = 1;
        for (const auto& [number, file] : pictures_.shown) {
            if (number != expected)
                say(file, "is not shown: there is none before it");
            expected = number + 1;
        }
        if (count() > picturesAtMost)
            say(std::to_string(count()) + " pictures, at most " + std::to_string(picturesAtMost) + " fit");
    }

    void checkVariants() {
        for (const auto& [number, file] : pictures_.markers) {
            if (!pictures_.shown.count(number))
                say(file, "belongs to no picture");
            else if (number == pictures_.shown.rbegin()->first)
                say(file, "would stay: nothing follows the last picture");
        }
        for (const auto& [number, file] : pictures_.russian) {
            if (!pictures_.shown.count(number))
                say(file, "belongs to no picture");
        }
        for (const auto& [number, file] : pictures_.russianMarkers)
            say(file, "is not shown: the marker of the first variant serves both");
    }

    void checkPicture(const fs::path& file) {
        const std::optional<Bitmap> bitmap = readPng(file);
        if (!bitmap)
            return say(file, "is no PNG");
        if (!isTall(*bitmap) && (bitmap->width != pageWidth || bitmap->height != pageHeight))
            return say(file, "is " + sizeText(*bitmap) + ", not 716x655 or, alone, 716x756 to 716x1500");
        if (isTall(*bitmap) && !pictures_.russian.empty())
            say(file, "has a Russian variant, which is not shown of a tall picture");
        if (!hasEdge(*bitmap, 0xffffffff, ground))
            say(file, "has another border than #DCE8EC");
    }

    void checkMarker(const fs::path& file) {
        const std::optional<Bitmap> bitmap = readPng(file);
        if (!bitmap)
            return say(file, "is no PNG");
        if (bitmap->width != pageWidth || bitmap->height != pageHeight)
            return say(file, "is " + sizeText(*bitmap) + ", not 716x655");
        if (!hasEdge(*bitmap, 0xff000000, 0))
            say(file, "reaches the border");
        if (std::all_of(bitmap->pixels.begin(), bitmap->pixels.end(), [](std::uint32_t p) { return p >> 24 == 0; }))
            say(file, "is empty");
    }

    bool isTall(const Bitmap& bitmap) const {
        return count() == 1 && bitmap.width == pageWidth && bitmap.height >= tallAtLeast && bitmap.height <= tallAtMost;
    }

    static std::string sizeText(const Bitmap& bitmap) {
        return std::to_string(bitmap.width) + "x" + std::to_string(bitmap.height);
    }

    const Tip& tip_;
    const Pictures pictures_;
    Problems problems_;
};

}  // namespace

Pictures picturesOf(const Tip& tip) {
    Pictures pictures;
    for (const fs::path& file : filesIn(folderOf(tip)))
        sortInto(pictures, tip, file);
    return pictures;
}

Problems picturesFitThePage(const Tip& tip) {
    return tip.detail.image.text.empty() ? Problems{} : Inspection(tip).problems();
}

Problems picturesBelongToTips(const std::vector<Tip>& tips) {
    std::set<fs::path> folders;
    for (const Tip& tip : tips)
        folders.insert(folderOf(tip));
    Problems problems;
    for (const fs::path& folder : folders) {
        for (const fs::path& file : filesIn(folder)) {
            const bool shown = std::any_of(tips.begin(), tips.end(), [&](const Tip& tip) {
                Pictures ignored;
                return folderOf(tip) == folder && !tip.detail.image.text.empty() && sortInto(ignored, tip, file);
            });
            if (!shown)
                problems.push_back(file.string() + ": no tip shows it");
        }
    }
    return problems;
}

}  // namespace catalogue
