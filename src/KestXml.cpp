#include "KestXml.h"

#include "KestFiles.h"

#include <map>

namespace {

const int recoverFromErrors = 1;

/// More text than the entities of any file of a catalogue stand for.
const size_t mostReferredText = 16 * 1024 * 1024;

void freeText(xmlChar* text) {
    xmlFree(text);
}

/// Files that are larger take more memory, parsed, than a device has.
const std::uintmax_t largestFile = 16 * 1024 * 1024;

/// The parser compares every attribute of an element with all the others.
const size_t mostAttributes = 4096;

bool beginsWith(const std::string& text, const std::string& begin) {
    return text.compare(0, begin.size(), begin) == 0;
}

/// The parser would unpack it, to any size.
bool isCompressed(const std::string& text) {
    const std::string gzip("\x1f\x8b");
    const std::string xz("\xfd"
                         "7zXZ");
    const std::string lzma("\x5d\0\0", 3);
    return beginsWith(text, gzip) || beginsWith(text, xz) || beginsWith(text, lzma);
}

/// Counted roughly: what looks like attributes between two angle brackets.
bool hasTooManyAttributes(const std::string& text) {
    size_t count = 0;
    char last = '\0';
    for (const char character : text) {
        if (character == '<' || character == '>') {
            count = 0;
        } else if (last == '=' && (character == '"' || character == '\'') && ++count > mostAttributes) {
            return true;
        }
        last = character;
    }
    return false;
}

bool isReadable(const std::string& path) {
    if (!KestFiles::isRegular(path) || KestFiles::size(path) > largestFile) {
        return false;
    }
    const std::string text = KestFiles::readBegin(path, largestFile);
    return !isCompressed(text) && !hasTooManyAttributes(text);
}

/// How much text the entities stand for that a document refers to. A few kilobytes of nested declarations can stand
/// for gigabytes, which the parser does not notice while it only refers to them.
class ReferredText {
public:
    size_t lengthIn(const xmlDoc* document) { return lengthOf(xmlDocGetRootElement(document), false); }

private:
    /// Of a node and those after it, with the text between the references or without it.
    size_t lengthOf(const xmlNode* first, bool withPlainText) {
        size_t length = 0;
        for (const xmlNode* node = first; node && length <= mostReferredText; node = node->next) {
            if (node->type == XML_ENTITY_REF_NODE) {
                length += lengthOf(xmlGetDocEntity(node->doc, node->name));
            } else if (node->type == XML_ELEMENT_NODE) {
                for (const xmlAttr* attribute = node->properties; attribute; attribute = attribute->next) {
                    length += lengthOf(attribute->children, withPlainText);
                }
                length += lengthOf(node->children, withPlainText);
            } else if (withPlainText && node->content) {
                length += static_cast<size_t>(xmlStrlen(node->content));
            }
        }
        return length;
    }

    size_t lengthOf(const xmlEntity* entity) {
        if (!entity) {
            return 0;
        }
        const auto known = lengths_.find(entity);
        if (known != lengths_.end()) {
            return known->second;
        }
        // Stands until the real length is known, so that an entity that holds itself ends the search.
        lengths_[entity] = mostReferredText + 1;
        const size_t length = lengthOf(entity->children, true);
        lengths_[entity] = length;
        return length;
    }

    std::map<const xmlEntity*, size_t> lengths_;
};

/// From a node and those after it.
void removeReferences(xmlNode* first) {
    for (xmlNode* node = first; node;) {
        xmlNode* next = node->next;
        if (node->type == XML_ENTITY_REF_NODE) {
            xmlUnlinkNode(node);
            xmlFreeNode(node);
        } else if (node->type == XML_ELEMENT_NODE) {
            for (xmlAttr* attribute = node->properties; attribute; attribute = attribute->next) {
                removeReferences(attribute->children);
            }
            removeReferences(node->children);
        }
        node = next;
    }
}

}  // namespace

KestXmlDocument::Result KestXmlDocument::read(const std::string& path) {
    document_.reset(isReadable(path) ? xmlReadFile(path.c_str(), "utf-8", recoverFromErrors) : nullptr);
    if (!document_) {
        return Result::NotRead;
    }
    xmlNode* root = xmlDocGetRootElement(document_.get());
    // Without declarations of its own a document has no entity that stands for more than a character.
    if (document_->intSubset && ReferredText().lengthIn(document_.get()) > mostReferredText) {
        removeReferences(root);
    }
    return root && root->children ? Result::Ok : Result::Empty;
}

xmlNode* KestXmlDocument::findSection(const char* name) const {
    xmlNode* node = xmlDocGetRootElement(document_.get())->children;
    while (node && !isElement(node, name)) {
        node = node->next;
    }
    return node;
}

bool KestXmlDocument::isElement(const xmlNode* node, const char* name) {
    return node->type == XML_ELEMENT_NODE && xmlStrcmp(node->name, reinterpret_cast<const xmlChar*>(name)) == 0;
}

KestXmlDocument::Text KestXmlDocument::content(xmlNode* node) {
    return Text(xmlNodeGetContent(node), freeText);
}

KestXmlDocument::Text KestXmlDocument::attribute(xmlNode* node, const char* name) {
    return Text(xmlGetProp(node, reinterpret_cast<const xmlChar*>(name)), freeText);
}
