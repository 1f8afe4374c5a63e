#pragma once

#include "KestLoadWork.h"

#include <libxml/parser.h>
#include <libxml/tree.h>

#include <memory>
#include <string>

/// One of the catalogue's XML files, parsed, and what the loaders ask of its nodes. Frees the document with itself.
class KestXmlDocument {
public:
    /// Parses the file, recovering from errors. Never blocks: what is not a regular file is not opened. Nor is parsed
    /// what KestXmlLimits does not accept or `work` has nothing left for. References to entities that the file
    /// declares are left out when they stand for more text than any catalogue has.
    /// False for what could not be parsed at all, and for a document without a root element or whose root has no
    /// children; failure() says which.
    bool read(const std::string& path, KestLoadWork& work);
    const char* failure() const;

    /// The first element of that name below the root; null when there is none. Only after read() was true.
    xmlNode* findSection(const char* name) const;

    static bool isElement(const xmlNode* node, const char* name);

    /// The node's text, markup inside it dropped, as a string that is freed with xmlFree(); null when it has none.
    using Text = std::unique_ptr<xmlChar, void (*)(xmlChar*)>;
    static Text content(xmlNode* node);
    /// An attribute's value; null when the node has no such attribute.
    static Text attribute(xmlNode* node, const char* name);

    static std::string str(const Text& text) { return text ? reinterpret_cast<const char*>(text.get()) : ""; }

private:
    struct FreeDocument {
        void operator()(xmlDoc* document) const { xmlFreeDoc(document); }
    };
    std::unique_ptr<xmlDoc, FreeDocument> document;
};
