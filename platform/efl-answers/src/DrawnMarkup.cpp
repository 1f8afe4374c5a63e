#include "DrawnMarkup.h"

#include <algorithm>
#include <array>
#include <string_view>
#include <vector>

namespace efl_answers {
namespace {

/// Copies markup and keeps in mind which of the open tags are links.
class Drawing {
public:
    explicit Drawing(bool rightToLeft) : rightToLeft_(rightToLeft) {}

    void addText(std::string_view text) { drawn_ += text; }

    /// `tag` is what stands between "<" and ">".
    void addTag(std::string_view tag) {
        if (tag == "/")
            closeLast();
        else if (tag == "/a")
            closeLink();
        else if (tag.substr(0, 1) == "/")
            closeOther(tag);
        else
            open(tag);
    }

    std::string take() { return std::move(drawn_); }

private:
    void open(std::string_view tag) {
        const bool isLink = tag == "a" || tag.substr(0, 2) == "a ";
        if (isLink)
            drawn_ += "<link>";
        drawn_ += "<" + aligned(tag) + ">";
        constexpr std::array<std::string_view, 3> alone{"br", "ps", "tab"};
        const bool isAlone =
            (!tag.empty() && tag.back() == '/') || std::find(alone.begin(), alone.end(), tag) != alone.end();
        if (!isAlone)
            isLink_.push_back(isLink);
    }

    void closeLast() {
        drawn_ += "</>";
        if (isLink_.empty())
            return;
        if (isLink_.back())
            drawn_ += "</link>";
        isLink_.pop_back();
    }

    void closeLink() {
        drawn_ += "</a>";
        const auto link = std::find(isLink_.rbegin(), isLink_.rend(), true);
        if (link == isLink_.rend())
            return;
        drawn_ += "</link>";
        isLink_.erase(std::next(link).base());
    }

    void closeOther(std::string_view tag) {
        drawn_ += "<";
        drawn_ += tag;
        drawn_ += ">";
        const auto other = std::find(isLink_.rbegin(), isLink_.rend(), false);
        if (other != isLink_.rend())
            isLink_.erase(std::next(other).base());
    }

    std::string aligned(std::string_view tag) const {
        constexpr std::string_view left = " align=left";
        std::string text(tag);
        const auto at = (" " + text + " ").find(std::string(left) + " ");
        if (rightToLeft_ && at != std::string::npos)
            text.replace(at + left.size() - 1 - 4, 4, "auto");
        return text;
    }

    bool rightToLeft_;
    std::string drawn_;
    std::vector<bool> isLink_;
};

}  // namespace

std::string drawnMarkup(const std::string& markup, bool rightToLeft) {
    Drawing drawing(rightToLeft);
    const std::string_view all = markup;
    std::size_t begin = 0;
    while (begin < all.size()) {
        const std::size_t open = std::min(all.find('<', begin), all.size());
        drawing.addText(all.substr(begin, open - begin));
        const std::size_t close = all.find('>', open);
        if (close == std::string_view::npos) {
            drawing.addText(all.substr(open));
            break;
        }
        drawing.addTag(all.substr(open + 1, close - open - 1));
        begin = close + 1;
    }
    return drawing.take();
}

}  // namespace efl_answers
