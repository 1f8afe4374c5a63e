#include "Xml.h"

#include "support/TemporaryFolder.h"

#include <libxml/parser.h>
#include <stdexcept>

namespace catalogue {
namespace {

struct FreeText {
    void operator()(xmlChar* text) const { xmlFree(text); }
};
using Text = std::unique_ptr<xmlChar, FreeText>;

std::string copyOf(const Text& text) {
    return text ? reinterpret_cast<const char*>(text.get()) : "";
}

/// Keeps the first thing that libxml2 says while it lives; what follows it is mostly its consequence.
class FirstError {
public:
    FirstError() { xmlSetStructuredErrorFunc(this, keep); }
    ~FirstError() { xmlSetStructuredErrorFunc(nullptr, nullptr); }
    FirstError(const FirstError&) = delete;
    FirstError& operator=(const FirstError&) = delete;

    const std::string& text() const { return text_; }

private:
    static void keep(void* self, xmlError* error) noexcept {
        std::string& text = static_cast<FirstError*>(self)->text_;
        if (text.empty())
            text = std::to_string(error->line) + ": " + (error->message ? error->message : "");
    }

    std::string text_;
};

const xmlChar* xmlName(const char* name) {
    return reinterpret_cast<const xmlChar*>(name);
}

}  // namespace

Document readDocument(const std::filesystem::path& file) {
    return readDocument(support::readFile(file), file.string());
}

Document readDocument(const std::string& text, const std::string& name) {
    const FirstError error;
    Document document(
        xmlReadMemory(text.data(), static_cast<int>(text.size()), name.c_str(), "utf-8", XML_PARSE_NONET));
    if (!document)
        throw std::runtime_error(name + ":" + error.text().substr(0, error.text().find('\n')));
    return document;
}

std::vector<xmlNode*> childrenNamed(const xmlNode* element, const char* name) {
    std::vector<xmlNode*> found;
    for (xmlNode* child = element ? element->children : nullptr; child; child = child->next) {
        if (child->type == XML_ELEMENT_NODE && xmlStrEqual(child->name, xmlName(name)))
            found.push_back(child);
    }
    return found;
}

xmlNode* childNamed(const xmlNode* element, const char* name) {
    const std::vector<xmlNode*> found = childrenNamed(element, name);
    return found.empty() ? nullptr : found.front();
}

std::string textOf(const xmlNode* element) {
    return element ? copyOf(Text(xmlNodeGetContent(element))) : "";
}

std::string attributeOf(const xmlNode* element, const char* name) {
    return element ? copyOf(Text(xmlGetProp(element, xmlName(name)))) : "";
}

}  // namespace catalogue
