#include "Rules.h"

#include "Markup.h"

#include <algorithm>
#include <libxml/xmlstring.h>
#include <map>
#include <set>

namespace catalogue {
namespace {

constexpr std::size_t pagesAtMost = 15;

const std::vector<std::string> regions = {"Global", "India", "Russia", "Indonesia", "SWA", "Africa"};

std::string at(const std::string& file, long line, const std::string& problem) {
    return file + ":" + std::to_string(line) + ": " + problem;
}

/// One problem in one of the languages.
std::string inLanguage(const std::string& file, long line, const std::string& problem, const std::string& language) {
    return at(file, line, problem + " in " + language);
}

std::map<std::string, long> idsOf(const Tip& tip) {
    std::map<std::string, long> ids = {{tip.detail.titleId.text, tip.detail.titleId.number},
                                       {tip.detail.appNameId.text, tip.detail.appNameId.number}};
    for (const std::string& id : textIdsOf(tip.detail.contents.text))
        ids.emplace(id, tip.detail.contents.number);
    return ids;
}

std::size_t count(const std::string& text, const std::string& part) {
    std::size_t found = 0;
    for (std::size_t place = text.find(part); place != std::string::npos; place = text.find(part, place + 1))
        ++found;
    return found;
}

bool hasCountry(const std::string& language, const std::string& region) {
    return region == language || region == language.substr(0, 2);
}

/// The letters of the languages that have letters of their own, first and last.
const std::map<std::string, std::pair<int, int>> letters = {
    {"ar", {0x0620, 0x06FF}}, {"hi", {0x0900, 0x097F}}, {"ko", {0xAC00, 0xD7A3}},
    {"ru", {0x0400, 0x04FF}}, {"zh", {0x4E00, 0x9FFF}},
};

bool hasLetterBetween(int first, int last, const std::string& text) {
    for (std::size_t at = 0; at < text.size();) {
        int length = static_cast<int>(text.size() - at);
        const int letter = xmlGetUTF8Char(reinterpret_cast<const unsigned char*>(text.data()) + at, &length);
        if (letter >= first && letter <= last)
            return true;
        at += static_cast<std::size_t>(std::max(1, length));
    }
    return false;
}

}  // namespace

std::optional<std::string> textIn(const std::string& language, const Tip& tip, const std::string& id,
                                  const SharedTexts& shared) {
    if (std::optional<std::string> text = shared(language, id))
        return text;
    const std::vector<String>& own = tip.strings.strings;
    for (const std::string& region : {language.substr(0, 5), language.substr(0, 2)}) {
        const auto last = std::find_if(
            own.rbegin(), own.rend(), [&](const String& string) { return string.region == region && string.id == id; });
        if (last != own.rend())
            return last->value;
    }
    return std::nullopt;
}

Problems contentsAreWellWritten(const Tip& tip) {
    Problems problems;
    const Detail& detail = tip.detail;
    for (const std::string& problem : contentsProblems(detail.contents.text))
        problems.push_back(at(detail.file, detail.contents.number, problem));
    if (detail.contents.text.find(detail.titleId.text) != std::string::npos)
        problems.push_back(at(detail.file, detail.contents.number,
                              "the contents hold the title's id \"" + detail.titleId.text +
                                  "\" and would be cut as contents of the old form"));
    return problems;
}

Problems idsAreTranslated(const Tip& tip, const std::vector<std::string>& languages, const SharedTexts& shared) {
    Problems problems;
    const std::map<std::string, long> ids = idsOf(tip);
    for (const auto& [id, line] : ids) {
        for (const std::string& language : languages) {
            if (!textIn(language, tip, id, shared))
                problems.push_back(inLanguage(tip.detail.file, line, id + " has no text", language));
        }
    }
    for (const String& string : tip.strings.strings) {
        if (!ids.count(string.id))
            problems.push_back(at(tip.strings.file, string.line, "nobody uses " + string.id));
        if (std::none_of(languages.begin(), languages.end(),
                         [&](const std::string& language) { return hasCountry(language, string.region); }))
            problems.push_back(at(tip.strings.file, string.line, "the device has no language " + string.region));
    }
    return problems;
}

Problems translationsHaveLettersOfTheirLanguage(const Tip& tip) {
    Problems problems;
    for (const String& string : tip.strings.strings) {
        const auto own = letters.find(string.region.substr(0, 2));
        if (own != letters.end() && !hasLetterBetween(own->second.first, own->second.second, string.value))
            problems.push_back(at(tip.strings.file, string.line, string.id + " is not written in " + string.region));
    }
    return problems;
}

Problems translationsFitTheirPlace(const Tip& tip, const std::vector<std::string>& languages,
                                   const SharedTexts& shared) {
    Problems problems;
    const Detail& detail = tip.detail;
    for (const std::string& language : languages) {
        const auto translate = [&](const std::string& id) { return textIn(language, tip, id, shared).value_or(id); };
        for (const Line& id : {detail.titleId, detail.appNameId}) {
            if (translate(id.text).find_first_of("<&\n") != std::string::npos)
                problems.push_back(inLanguage(detail.file, id.number, id.text + " is no plain line", language));
        }
        const std::string contents = translateContents(detail.contents.text, translate);
        for (const std::string& problem : markupProblems(contents))
            problems.push_back(inLanguage(detail.file, detail.contents.number, problem, language));
        for (const Attachment& attachment : detail.attachments) {
            if (count(contents, attachment.id) != 1)
                problems.push_back(inLanguage(detail.file, attachment.markup.number,
                                              attachment.id + " does not stand once in the contents", language));
        }
    }
    for (const Attachment& attachment : detail.attachments) {
        for (const std::string& problem : markupProblems(attachment.markup.text))
            problems.push_back(at(detail.file, attachment.markup.number, problem));
    }
    return problems;
}

Problems filesExist(const Tip& tip) {
    std::vector<std::pair<std::string, long>> files;
    if (!tip.detail.image.text.empty())
        files.emplace_back(tip.detail.image.text, tip.detail.image.number);
    for (const std::string& file : filesOf(tip.detail.contents.text))
        files.emplace_back(file, tip.detail.contents.number);
    for (const Attachment& attachment : tip.detail.attachments) {
        for (const std::string& file : filesOf(attachment.markup.text))
            files.emplace_back(file, attachment.markup.number);
    }
    Problems problems;
    for (const auto& [file, line] : files) {
        if (!std::filesystem::is_regular_file(tip.sharedResources / file))
            problems.push_back(at(tip.detail.file, line, "no file " + file));
    }
    return problems;
}

Problems pathsAreUnique(const std::vector<Tip>& tips) {
    Problems problems;
    std::map<std::string, std::string> owners;
    for (const Tip& tip : tips) {
        std::string key = tip.path;
        std::replace(key.begin(), key.end(), '/', '_');
        const auto [owner, isNew] = owners.emplace(key, tip.path);
        if (!isNew)
            problems.push_back(at("kest_menu.xml", tip.line, tip.path + " is kept as " + owner->second + " is"));
    }
    return problems;
}

Problems stringsAgree(const std::vector<Tip>& tips) {
    Problems problems;
    std::map<std::pair<std::string, std::string>, std::string> values;
    for (const Tip& tip : tips) {
        for (const String& string : tip.strings.strings) {
            const auto [first, isNew] = values.emplace(std::pair(string.region, string.id), string.value);
            if (!isNew && first->second != string.value)
                problems.push_back(
                    at(tip.strings.file, string.line, string.id + " has another text in " + string.region + " before"));
        }
    }
    return problems;
}

std::size_t tipsIn(const std::string& region, const std::vector<Tip>& tips) {
    return static_cast<std::size_t>(std::count_if(
        tips.begin(), tips.end(), [&](const Tip& tip) { return tip.state.find(region) != std::string::npos; }));
}

Problems regionsAreNotTooFull(const std::vector<Tip>& tips) {
    Problems problems;
    for (const std::string& region : regions) {
        const std::size_t offered = tipsIn(region, tips);
        if (offered > pagesAtMost)
            problems.push_back("kest_menu.xml: " + std::to_string(offered) + " tips in " + region + ", at most " +
                               std::to_string(pagesAtMost) + " fit");
    }
    return problems;
}

}  // namespace catalogue
