#include "device/Link.h"

#include "Utf8.h"
#include "device/Error.h"
#include "device/OneLine.h"

#include <algorithm>
#include <libxml/uri.h>
#include <memory>
#include <regex>
#include <set>
#include <sstream>
#include <utility>

namespace device {
namespace {

constexpr std::size_t longestForm = 1000;
constexpr std::size_t longestShown = 200;

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

bool hasAuthority(const std::string& uri) {
    const std::size_t colon = uri.find(':');
    return colon != std::string::npos && uri.compare(colon + 1, 2, "//") == 0;
}

}  // namespace

Link::Link(const std::string& form) : form_(form) {
    static const std::regex pattern(R"(([A-Za-z][A-Za-z0-9+.-]*):\{(\w+)\}(?:\{\?(\w+(?:,\w+)*)\})?)");
    std::smatch match;
    // The expression takes memory for each character.
    if (form.size() > longestForm || !std::regex_match(form, match, pattern))
        throw Error('"' + oneLine(form, longestShown) +
                    "\" is no form of links; write SCHEME:{NAME} or SCHEME:{NAME}{?NAME,NAME}");
    scheme_ = lowered(match[1]);
    first_ = match[2];
    if (match[3].matched)
        others_ = partsOf(match[3], ',');
    std::set<std::string> names{first_};
    for (const std::string& name : others_)
        if (!names.insert(name).second)
            throw Error(std::string("\"")
                            .append(form)
                            .append("\" is no form of links: it has the name \"")
                            .append(name)
                            .append("\" twice"));
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
        return extras;
    } catch (const Error& fault) {
        throw Error("cannot open \"" + oneLine(uri, longestShown) + "\": " + fault.what() +
                    "; such a link is written " + form_);
    }
}

Extras Link::readQuery(const std::string& query) const {
    Extras extras;
    for (const std::string& part : partsOf(query, '&')) {
        const std::size_t equals = part.find('=');
        if (equals == std::string::npos)
            throw Error("its query has \"" + oneLine(part, longestShown) + "\", which is not NAME=VALUE");
        const std::string name = part.substr(0, equals);
        if (std::find(others_.begin(), others_.end(), name) == others_.end())
            throw Error("nothing in it may be called \"" + oneLine(name, longestShown) + '"');
        if (std::any_of(extras.begin(), extras.end(), [&](const auto& extra) { return extra.first == name; }))
            throw Error("it gives \"" + name + "\" twice");
        extras.emplace_back(name, decoded(name, part.substr(equals + 1)));
    }
    return extras;
}

}  // namespace device
