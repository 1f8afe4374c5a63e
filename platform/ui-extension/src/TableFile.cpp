#include "TableFile.h"

#include "RegularFile.h"

#include <libxml/parser.h>
#include <libxml/parserInternals.h>
#include <libxml/tree.h>

#include <algorithm>
#include <memory>

namespace uxt {
namespace {

struct FreeContext {
    void operator()(xmlParserCtxt* context) const { xmlFreeParserCtxt(context); }
};
struct FreeDocument {
    void operator()(xmlDoc* document) const { xmlFreeDoc(document); }
};
using Context = std::unique_ptr<xmlParserCtxt, FreeContext>;
using Document = std::unique_ptr<xmlDoc, FreeDocument>;

std::string quoted(const xmlChar* name) {
    return "\"" + std::string(reinterpret_cast<const char*>(name)) + "\"";
}

std::string withoutLineEnd(const char* message) {
    std::string text = message ? message : "is not well-formed";
    while (!text.empty() && (text.back() == '\n' || text.back() == ' '))
        text.pop_back();
    return text;
}

/// What stopped a parser; the first thing counts, the others follow from it.
struct Complaint {
    long line = 0;
    std::string what;
};

void note(xmlParserCtxt* context, long line, const std::string& what) {
    auto* complaint = static_cast<Complaint*>(context->_private);
    if (complaint->what.empty())
        *complaint = {line, what};
}

void noteError(void* parser, xmlError* error) {
    note(static_cast<xmlParserCtxt*>(parser), error->line, withoutLineEnd(error->message));
}

void refuseDocumentType(void* parser, const xmlChar*, const xmlChar*, const xmlChar*) {
    auto* context = static_cast<xmlParserCtxt*>(parser);
    note(context, context->input->line, "a document type is not allowed");
    xmlStopParser(context);
}

Document parse(const std::string& file) {
    const std::string text = readRegularFile(file);
    const Context context(xmlNewParserCtxt());
    if (!context)
        throw std::bad_alloc();
    Complaint complaint;
    context->_private = &complaint;
    context->sax->serror = noteError;
    // Without a document type there are no entities but the five that XML has.
    context->sax->internalSubset = refuseDocumentType;
    Document document(xmlCtxtReadMemory(context.get(), text.data(), static_cast<int>(text.size()), nullptr, nullptr,
                                        XML_PARSE_NONET | XML_PARSE_BIG_LINES));
    if (!complaint.what.empty())
        throw TableError(file, complaint.line, complaint.what);
    if (!document)
        throw TableError(file, "is not well-formed");
    return document;
}

/// Where an author looks for it. (The parser gives a text the line in which it ends.)
long lineOf(const xmlNode* node) {
    return xmlGetLineNo(node->type == XML_TEXT_NODE ? node->parent : node);
}

bool isBlank(const xmlNode* node) {
    return node->type == XML_COMMENT_NODE || (node->type == XML_TEXT_NODE && xmlIsBlankNode(node));
}

std::string valueOf(const xmlAttr* attribute) {
    const std::unique_ptr<xmlChar, decltype(xmlFree)> value(
        xmlNodeListGetString(attribute->doc, attribute->children, 1), xmlFree);
    return value ? reinterpret_cast<const char*>(value.get()) : "";
}

TableEntry readEntry(const std::string& file, const xmlNode* node, const TableShape& shape) {
    TableEntry entry{xmlGetLineNo(node), {}};
    for (const xmlAttr* attribute = node->properties; attribute; attribute = attribute->next) {
        const std::string name = reinterpret_cast<const char*>(attribute->name);
        if (std::find(shape.attributes.begin(), shape.attributes.end(), name) == shape.attributes.end())
            throw TableError(file, entry.line, quoted(node->name) + " has no attribute " + quoted(attribute->name));
        entry.values[name] = valueOf(attribute);
    }
    for (const std::string& name : shape.attributes) {
        if (entry.values[name].empty())
            throw TableError(file, entry.line, quoted(node->name) + " needs the attribute \"" + name + "\"");
    }
    for (const xmlNode* child = node->children; child; child = child->next) {
        if (!isBlank(child))
            throw TableError(file, lineOf(child), quoted(node->name) + " holds nothing");
    }
    return entry;
}

}  // namespace

TableError::TableError(const std::string& file, const std::string& what)
    : std::runtime_error(file + ": error: " + what) {}

TableError::TableError(const std::string& file, long line, const std::string& what)
    : std::runtime_error(file + ":" + std::to_string(line) + ": error: " + what) {}

std::vector<TableEntry> readTableFile(const std::string& file, const TableShape& shape) {
    const Document document = parse(file);
    const xmlNode* root = xmlDocGetRootElement(document.get());
    const auto isNamed = [](const xmlNode* node, const std::string& name) {
        return node->type == XML_ELEMENT_NODE && name == reinterpret_cast<const char*>(node->name);
    };
    if (!isNamed(root, shape.root))
        throw TableError(file, xmlGetLineNo(root),
                         "the root element is " + quoted(root->name) + ", not \"" + shape.root + "\"");

    std::vector<TableEntry> entries;
    std::map<std::string, long> lines;
    for (const xmlNode* node = root->children; node; node = node->next) {
        if (isBlank(node))
            continue;
        if (!isNamed(node, shape.entry))
            throw TableError(file, lineOf(node), "\"" + shape.root + "\" holds \"" + shape.entry + "\" elements only");
        entries.push_back(readEntry(file, node, shape));
        const std::string& key = entries.back().values[shape.attributes.front()];
        const auto [first, isNew] = lines.emplace(key, entries.back().line);
        if (!isNew)
            throw TableError(file, entries.back().line,
                             "\"" + key + "\" stands in line " + std::to_string(first->second) + " already");
    }
    return entries;
}

}  // namespace uxt
