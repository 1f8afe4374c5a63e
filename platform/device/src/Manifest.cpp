#include "Files.h"
#include "device/BusName.h"
#include "device/Error.h"
#include "device/Packages.h"

#include <algorithm>
#include <cerrno>
#include <fcntl.h>
#include <libxml/parser.h>
#include <memory>
#include <string_view>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>
#include <vector>

namespace device {
namespace {

constexpr std::size_t largestManifest = 1024 * 1024;
constexpr std::size_t readAtOnce = 16 * 1024;

/// Frees a libxml2 object with its own function.
template <auto release>
struct Release {
    template <class Object>
    void operator()(Object* object) const {
        release(object);
    }
};
using Parser = std::unique_ptr<xmlParserCtxt, Release<xmlFreeParserCtxt>>;
using Document = std::unique_ptr<xmlDoc, Release<xmlFreeDoc>>;

void releaseText(xmlChar* text) {
    xmlFree(text);
}
using Text = std::unique_ptr<xmlChar, Release<releaseText>>;

std::string stringOf(const Text& text) {
    return text ? reinterpret_cast<const char*>(text.get()) : "";
}

[[noreturn]] void fail(const std::filesystem::path& file, long line, const std::string& what) {
    throw Error(file.string() + (line > 0 ? ":" + std::to_string(line) : std::string()) + ": " + what);
}

std::string contentsOf(const std::filesystem::path& file) {
    // Without waiting: a FIFO in its place must not hang whoever looks for packages.
    const Descriptor descriptor(open(file.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    if (!descriptor)
        fail(file, 0, "cannot be read: " + reasonOf(errno) + "; a package has a tizen-manifest.xml in its folder");
    struct stat status {};
    if (fstat(descriptor.get(), &status) != 0 || !S_ISREG(status.st_mode))
        fail(file, 0, "is not a file");
    std::string text;
    char part[readAtOnce];
    while (text.size() <= largestManifest) {
        const ssize_t count = read(descriptor.get(), part, sizeof part);
        if (count < 0)
            fail(file, 0, "cannot be read: " + reasonOf(errno));
        if (count == 0)
            return text;
        text.append(part, static_cast<std::size_t>(count));
    }
    fail(file, 0, "is larger than 1 MiB; a manifest is not");
}

Document parsed(const std::filesystem::path& file) {
    const std::string text = contentsOf(file);
    const Parser parser(xmlNewParserCtxt());
    if (!parser)
        throw std::bad_alloc();
    Document document(xmlCtxtReadMemory(parser.get(), text.data(), static_cast<int>(text.size()), nullptr, nullptr,
                                        XML_PARSE_NONET | XML_PARSE_NOERROR | XML_PARSE_NOWARNING));
    if (!document) {
        const xmlError* error = xmlCtxtGetLastError(parser.get());
        std::string message = error && error->message ? error->message : "it is empty";
        message.erase(message.find_last_not_of('\n') + 1);
        fail(file, error ? error->line : 0, "is not well-formed XML: " + message);
    }
    // An entity that is defined here could stand for gigabytes.
    if (document->intSubset)
        fail(file, 0, "has a document type; remove the <!DOCTYPE>");
    return document;
}

std::string_view nameOf(const xmlNode* node) {
    return node->type == XML_ELEMENT_NODE ? reinterpret_cast<const char*>(node->name) : std::string_view();
}

std::string attributeOf(xmlNode* node, const char* name) {
    return stringOf(Text(xmlGetProp(node, reinterpret_cast<const xmlChar*>(name))));
}

std::string trimmed(const std::string& text) {
    const std::size_t begin = text.find_first_not_of(" \t\r\n");
    return begin == std::string::npos ? "" : text.substr(begin, text.find_last_not_of(" \t\r\n") - begin + 1);
}

xmlNode* childNamed(xmlNode* parent, std::string_view name) {
    for (xmlNode* child = parent->children; child; child = child->next)
        if (nameOf(child) == name)
            return child;
    return nullptr;
}

/// "ko_kr" for "ko-KR".
std::string lowered(std::string language) {
    std::transform(language.begin(), language.end(), language.begin(), [](char c) {
        const bool isUpper = c >= 'A' && c <= 'Z';
        return c == '-' ? '_' : isUpper ? static_cast<char>(c - 'A' + 'a') : c;
    });
    return language;
}

/// The application's name, for all languages and for those that have one of their own.
void readLabels(Package& package, xmlNode* application) {
    bool hasLabel = false;
    for (xmlNode* child = application->children; child; child = child->next) {
        if (nameOf(child) != "label")
            continue;
        const std::string language = lowered(attributeOf(child, "lang"));
        const std::string label = trimmed(stringOf(Text(xmlNodeGetContent(child))));
        if (label.empty())
            continue;
        if (!language.empty())
            package.labels.emplace(language, label);
        else if (!std::exchange(hasLabel, true))
            package.label = label;
    }
}

/// The path of a file that the manifest names below one of the package's folders; "" for no name.
std::string pathBelow(const std::filesystem::path& folder, const std::string& name, const std::filesystem::path& file,
                      long line) {
    if (name.empty())
        return "";
    const std::filesystem::path relative = std::filesystem::path(name).lexically_normal();
    if (relative.is_absolute() || *relative.begin() == "..")
        fail(file, line, "\"" + name + "\" leads out of the package; give a path below " + folder.string());
    return (folder / relative).string();
}

constexpr std::string_view patternKey = "link.";

void readLinkPattern(Package& package, xmlNode* metadata, const std::filesystem::path& file) {
    const std::string name = attributeOf(metadata, "key").substr(patternKey.size());
    if (!package.link)
        fail(file, xmlGetLineNo(metadata), "there is a pattern for \"" + name + "\", but no form of links");
    try {
        package.link->restrict(name, attributeOf(metadata, "value"));
    } catch (const Error& fault) {
        fail(file, xmlGetLineNo(metadata), fault.what());
    }
}

/// How links lead into the application: <metadata key="link" value="SCHEME:{NAME}{?NAME,NAME}"/>, and of what pattern
/// the values of a name are: <metadata key="link.NAME" value="PATTERN"/>.
void readLink(Package& package, xmlNode* application, const std::filesystem::path& file) {
    std::vector<xmlNode*> patterns;
    for (xmlNode* child = application->children; child; child = child->next) {
        if (nameOf(child) != "metadata")
            continue;
        const std::string key = attributeOf(child, "key");
        if (key.starts_with(patternKey))
            patterns.push_back(child);
        if (key != "link")
            continue;
        if (package.link)
            fail(file, xmlGetLineNo(child), "there is a second form of links; an application has one");
        try {
            package.link.emplace(attributeOf(child, "value"));
        } catch (const Error& fault) {
            fail(file, xmlGetLineNo(child), fault.what());
        }
    }
    for (xmlNode* pattern : patterns)
        readLinkPattern(package, pattern, file);
}

void readApplication(Package& package, xmlNode* application, const std::filesystem::path& file) {
    const long line = xmlGetLineNo(application);
    const std::string id = attributeOf(application, "appid");
    if (id != package.id)
        fail(file, line,
             "the application's id \"" + id + "\" differs from the package's, \"" + package.id +
                 "\"; they must be equal");
    readLabels(package, application);
    readLink(package, application, file);
    package.exec = pathBelow(package.root / "bin", attributeOf(application, "exec"), file, line);
    if (xmlNode* icon = childNamed(application, "icon"))
        package.icon = pathBelow(package.root / "shared/res", trimmed(stringOf(Text(xmlNodeGetContent(icon)))), file,
                                 xmlGetLineNo(icon));
}

}  // namespace

const std::string& Package::labelIn(const std::string& language) const {
    const std::string wanted = lowered(language);
    for (const std::string& name : {wanted, wanted.substr(0, wanted.find('_'))})
        if (const auto found = labels.find(name); found != labels.end())
            return found->second;
    return label;
}

Package readManifest(const std::filesystem::path& root) {
    const std::filesystem::path file = root / "tizen-manifest.xml";
    const Document document = parsed(file);
    xmlNode* manifest = xmlDocGetRootElement(document.get());
    if (nameOf(manifest) != "manifest")
        fail(file, xmlGetLineNo(manifest), "the root element must be <manifest>");

    Package package;
    package.root = root;
    package.id = attributeOf(manifest, "package");
    package.version = attributeOf(manifest, "version");
    package.label = package.id;
    if (package.id.empty())
        fail(file, xmlGetLineNo(manifest), "<manifest> has no package id; give it the attribute package=\"...\"");
    if (!BusName::isValid(package.id))
        fail(file, xmlGetLineNo(manifest),
             "\"" + package.id +
                 "\" is no package id; it needs two or more words of letters, digits, "
                 "'-' and '_', joined by dots");
    for (xmlNode* child = manifest->children; child; child = child->next)
        if (nameOf(child) == "ui-application") {
            readApplication(package, child, file);
            break;
        }
    return package;
}

}  // namespace device
