#include "Markup.h"

#include <regex>

namespace catalogue {
namespace {

const std::regex textTag(R"re(<text id="(IDS_[A-Z0-9_]+)">[^<]*</text>)re");

std::string replaceAll(std::string text, const std::string& from, const std::string& to) {
    for (std::size_t at = text.find(from); at != std::string::npos; at = text.find(from, at + to.size()))
        text.replace(at, from.size(), to);
    return text;
}

/// Opens or closes a tag on the stack of open ones; returns what is wrong, or "".
std::string follow(const std::string& tag, std::vector<std::string>& open) {
    if (tag.size() > 1 && tag.back() == '/')
        return "";
    if (tag.front() != '/') {
        open.push_back(tag.substr(0, tag.find_first_of(" =")));
        return "";
    }
    const std::string name = tag.substr(1);
    if (open.empty())
        return "<" + tag + "> closes nothing";
    const std::string opened = open.back();
    open.pop_back();
    return name.empty() || name == opened ? "" : "<" + tag + "> closes <" + opened + ">";
}

std::vector<std::string> tagProblems(const std::string& markup) {
    std::vector<std::string> problems, open;
    for (std::size_t at = markup.find('<'); at != std::string::npos; at = markup.find('<', at + 1)) {
        const std::size_t end = markup.find_first_of("<>", at + 1);
        if (end == std::string::npos || markup[end] == '<' || end == at + 1) {
            problems.push_back("a \"<\" begins no tag");
            continue;
        }
        const std::string tag = markup.substr(at + 1, end - at - 1);
        const std::string problem = follow(tag, open);
        if (!problem.empty())
            problems.push_back(problem);
    }
    for (const std::string& name : open)
        problems.push_back("<" + name + "> is not closed");
    return problems;
}

}  // namespace

std::vector<std::string> markupProblems(const std::string& markup) {
    static const std::regex entity("&(amp|lt|gt|quot|apos|nbsp|#[0-9]+|#x[0-9a-fA-F]+);");
    std::vector<std::string> problems = tagProblems(markup);
    for (std::size_t at = markup.find('&'); at != std::string::npos; at = markup.find('&', at + 1)) {
        if (!std::regex_search(markup.begin() + static_cast<std::ptrdiff_t>(at), markup.end(), entity,
                               std::regex_constants::match_continuous))
            problems.push_back("an \"&\" begins no entity");
    }
    return problems;
}

std::vector<std::string> contentsProblems(const std::string& contents) {
    std::vector<std::string> problems;
    const std::string rest = std::regex_replace(contents, textTag, "");
    if (rest.find("<text") != std::string::npos || rest.find("</text") != std::string::npos)
        problems.push_back("a text tag is not of the form <text id=\"IDS_NAME\"></text>");
    if (rest.find("<item") != std::string::npos)
        problems.push_back("a picture stands in the contents, where a language without a title loses it; attach it");
    if (rest.find("<a href=app>") == std::string::npos)
        problems.push_back("no link <a href=app> opens the application");
    if (std::regex_search(contents, std::regex(R"(\n(?!<br/>)|\s\n)")))
        problems.push_back("a line ends elsewhere than right before <br/>, so that the line's end shows as a blank");
    return problems;
}

std::vector<std::string> textIdsOf(const std::string& contents) {
    std::vector<std::string> ids;
    for (std::sregex_iterator tag(contents.begin(), contents.end(), textTag), end; tag != end; ++tag)
        ids.push_back((*tag)[1]);
    return ids;
}

std::vector<std::string> filesOf(const std::string& markup) {
    static const std::regex reference("href=file:([^ >]*)");
    std::vector<std::string> files;
    for (std::sregex_iterator found(markup.begin(), markup.end(), reference), end; found != end; ++found)
        files.push_back((*found)[1]);
    return files;
}

std::string translateContents(const std::string& contents,
                              const std::function<std::string(const std::string& id)>& translate) {
    const std::string gap = "<font_size=16><br/></>";
    std::string translated;
    auto rest = contents.cbegin();
    for (std::sregex_iterator tag(contents.begin(), contents.end(), textTag), end; tag != end; ++tag) {
        const std::string value = replaceAll(replaceAll(translate((*tag)[1]), "\n", gap), "\\n", gap);
        translated.append(rest, (*tag)[0].first).append(replaceAll(value, "&", "&amp;"));
        rest = (*tag)[0].second;
    }
    return translated.append(rest, contents.cend());
}

}  // namespace catalogue
