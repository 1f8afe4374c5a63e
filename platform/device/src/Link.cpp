#include "device/Link.h"

#include "Utf8.h"
#include "device/Error.h"
#include "device/OneLine.h"

#include <algorithm>
#include <libxml/uri.h>
#include <optional>
#include <regex>
#include <set>
#include <sstream>
#include <utility>

namespace device {
namespace {

constexpr std::size_t longestForm = 1000;
/// Matching takes memory for each character, and so does a pattern.
constexpr std::size_t longestPattern = 1000;
constexpr std::size_t longestMatched = 255;

struct UriRelease {
    void operator()(xmlURI* uri) const { xmlFreeURI(uri); }
};
struct TextRelease {
    void operator()(char* text) const { xmlFree(text); }
};

std::string stringOf(const char* text) {
    return text ? text : "";
}

std::string lowered(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(),
                   [](char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; });
    return text;
}

std::vector<std::string> partsOf(const std::string& text, char separator) {
    std::vector<std::string> parts;
    std::istringstream stream(text + separator);
    for (std::string part; std::getline(stream, part, separator);)
        parts.push_back(part);
    return parts;
}

/// What percent-encoded text stands for. Throws Error for what no extra can be.
std::string decoded(const std::string& name, const std::string& raw) {
    if (raw.empty())
        throw Error("its \"" + name + "\" is empty");
    if (raw.find("%00") != std::string::npos)
        throw Error("its \"" + name + "\" has a zero byte");
    const std::unique_ptr<char, TextRelease> text(
        xmlURIUnescapeString(raw.c_str(), static_cast<int>(raw.size()), nullptr));
    if (!text)
        throw std::bad_alloc();
    if (!isUtf8(text.get()))
        throw Error("its \"" + name + "\" is not UTF-8");
    return text.get();
}

std::string quoted(const std::string& text) {
    return '"' + oneLine(text) + '"';
}

std::optional<std::regex> regexOf(const std::string& pattern) {
    if (pattern.empty() || pattern.size() > longestPattern)
        return std::nullopt;
    try {
        return std::regex(pattern, std::regex::ECMAScript);
    } catch (const std::regex_error&) {
        return std::nullopt;
    }
}

bool hasAuthority(const std::string& uri) {
    const std::size_t colon = uri.find(':');
    return colon != std::string::npos && uri.compare(colon + 1, 2, "//") == 0;
}

}  // namespace

struct Link::Pattern {
    std::string text;
    std::regex expression;
};

Link::Link(const std::string& form) : form_(form) {
    static const std::regex pattern(R"(([A-Za-z][A-Za-z0-9+.-]*):\{(\w+)\}(?:\{\?(\w+(?:,\w+)*)\})?)");
    std::smatch match;
    // The expression takes memory for each character.
    if (form.size() > longestForm || !std::regex_match(form, match, pattern))
        throw Error(quoted(form) + " is no form of links; write SCHEME:{NAME} or SCHEME:{NAME}{?NAME,NAME}");
    scheme_ = lowered(match[1]);
    first_ = match[2];
    if (match[3].matched)
        others_ = partsOf(match[3], ',');
    std::set<std::string> names{first_};
    for (const std::string& name : others_)
        if (!names.insert(name).second)
            throw Error(quoted(form) + " is no form of links: it has the name " + quoted(name) + " twice");
}

void Link::restrict(const std::string& name, const std::string& pattern) {
    if (name != first_ && std::find(others_.begin(), others_.end(), name) == others_.end())
        throw Error("there is a pattern for " + quoted(name) + ", a name that the links " + form_ + " do not have");
    if (patterns_.contains(name))
        throw Error("there is a second pattern for " + quoted(name) + " in links; a name has one");
    std::optional<std::regex> expression = regexOf(pattern);
    if (!expression)
        throw Error("the pattern for " + quoted(name) + " in links, " + quoted(pattern) +
                    ", is no regular expression of up to 1000 characters");
    patterns_.emplace(name, std::make_shared<const Pattern>(Pattern{pattern, *std::move(expression)}));
}

bool Link::isSchemeOf(const std::string& text) const {
    return lowered(text.substr(0, scheme_.size() + 1)) == scheme_ + ':';
}

Extras Link::extrasOf(const std::string& uri) const {
    try {
        if (uri.size() > LaunchRequest::mostBytes)
            throw Error("it is longer than 64 KiB");
        // Raw: what is percent-encoded is decoded once it is taken apart.
        const std::unique_ptr<xmlURI, UriRelease> parsed(xmlParseURIRaw(uri.c_str(), 1));
        if (!parsed)
            throw Error("it is no URI");
        if (lowered(stringOf(parsed->scheme)) != scheme_)
            throw Error("it does not begin with \"" + scheme_ + ":\"");
        if (hasAuthority(uri))
            throw Error("it names a host");
        if (uri.find('#') != std::string::npos)
            throw Error("it has a fragment");
        const std::string path = stringOf(parsed->path);
        if (path.find('/') != std::string::npos)
            throw Error("its \"" + first_ + "\" has a \"/\"");
        Extras extras{{first_, decoded(first_, path)}};
        if (uri.find('?') != std::string::npos)
            for (auto& extra : readQuery(stringOf(parsed->query_raw)))
                extras.push_back(std::move(extra));
        requireMatches(extras);
        return extras;
    } catch (const Error& fault) {
        throw Error("cannot open " + quoted(uri) + ": " + fault.what() + "; such a link is written " + form_);
    }
}

void Link::requireMatches(const Extras& extras) const {
    for (const auto& [name, value] : extras) {
        const auto found = patterns_.find(name);
        if (found == patterns_.end())
            continue;
        if (value.size() > longestMatched)
            throw Error("its \"" + name + "\" is longer than 255 bytes");
        if (!std::regex_match(value, found->second->expression))
            throw Error("its \"" + name + "\" is " + quoted(value) + ", which does not match " +
                        oneLine(found->second->text));
    }
}

Extras Link::readQuery(const std::string& query) const {
    Extras extras;
    for (const std::string& part : partsOf(query, '&')) {
        const std::size_t equals = part.find('=');
        if (equals == std::string::npos)
            throw Error("its query has " + quoted(part) + ", which is not NAME=VALUE");
        const std::string name = part.substr(0, equals);
        if (std::find(others_.begin(), others_.end(), name) == others_.end())
            throw Error("nothing in it may be called " + quoted(name));
        if (std::any_of(extras.begin(), extras.end(), [&](const auto& extra) { return extra.first == name; }))
            throw Error("it gives \"" + name + "\" twice");
        extras.emplace_back(name, decoded(name, part.substr(equals + 1)));
    }
    return extras;
}

}  // namespace device
