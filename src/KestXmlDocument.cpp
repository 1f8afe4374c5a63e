#include "KestXmlDocument.h"

#include "KestFiles.h"
#include "KestProcessorTime.h"
#include "KestXmlLimits.h"

#include <libxml/catalog.h>

#include <cstring>
#include <map>

namespace {

const int recoverFromErrors = 1;

/// More text than the entities of any file of a catalogue stand for.
const size_t mostReferredText = 1024 * 1024;

/// A file that is broken in thousands of places has fewer.
const size_t mostMessageBytes = 16 * 1024 * 1024;

/// The longest file takes a tenth of it, unless it is made to keep the parser busy: where there are hundreds of
/// thousands of different names, each takes longer than the one before.
const std::int64_t mostSeconds = 3;

/// What reading an element or a reference costs beside its text, in bytes of text.
const size_t costOfNode = 16;

void freeText(xmlChar* text) {
    xmlFree(text);
}

/// The text that the parser is given for the file that it opens. So it is the text that was judged, and the parser
/// neither unpacks it nor opens another file.
struct Source {
    const std::string& text;
    size_t at;
    /// As if the text ended here.
    bool isCut;
    KestProcessorTime time;
};
Source* source = nullptr;

int __isForParser(const char*) {
    return source ? 1 : 0;
}

void* __openText(const char*) {
    return source->at == 0 ? source : nullptr;
}

int __readText(void* context, char* buffer, int length) {
    auto* from = static_cast<Source*>(context);
    if (from->isCut || from->time.isOverAfter(static_cast<std::uint64_t>(length))) {
        return 0;
    }
    const size_t count = from->text.copy(buffer, static_cast<size_t>(length), from->at);
    from->at += count;
    return static_cast<int>(count);
}

int __closeText(void*) {
    return 0;
}

bool giveTextsToParser() {
    // The parser asks the callbacks that were registered last first, so its own must be there already.
    xmlInitParser();
    // Each catalog that a file names would be put at the end of a list which begins at its start.
    xmlCatalogSetDefaults(XML_CATA_ALLOW_NONE);
    return xmlRegisterInputCallbacks(__isForParser, __openText, __readText, __closeText) >= 0;
}

/// While it exists the parser reads `text` and keeps its messages, which would go to standard error, to itself.
class Parsing {
public:
    explicit Parsing(const std::string& text)
        : current{text, 0, false, KestProcessorTime(mostSeconds)}, messageBytes(0) {
        static const bool given = giveTextsToParser();
        source = given ? &current : nullptr;
        xmlSetStructuredErrorFunc(this, __dropMessage);
    }
    ~Parsing() {
        source = nullptr;
        xmlSetStructuredErrorFunc(nullptr, nullptr);
    }
    Parsing(const Parsing&) = delete;
    Parsing& operator=(const Parsing&) = delete;

private:
    /// A message quotes what it is about, all of it. The parser goes on after errors, but not after any number.
    static void __dropMessage(void* data, xmlErrorPtr error) {
        auto* parsing = static_cast<Parsing*>(data);
        for (const char* text : {error->message, error->str1, error->str2, error->str3}) {
            parsing->messageBytes += text ? std::strlen(text) : 0;
        }
        // The parser cannot be stopped from here: it goes on with what it has already read of the text.
        parsing->current.isCut = parsing->messageBytes > mostMessageBytes;
    }

    Source current;
    size_t messageBytes;
};

/// How much text the entities stand for that a document refers to. A few kilobytes of nested declarations can stand
/// for gigabytes, which the parser does not notice while it only refers to them.
class ReferredText {
public:
    size_t lengthIn(const xmlDoc* document) { return __lengthOf(xmlDocGetRootElement(document), false); }

private:
    /// Of a node and those after it, with the text between the references or without it.
    size_t __lengthOf(const xmlNode* first, bool withPlainText) {
        size_t length = 0;
        for (const xmlNode* node = first; node && length <= mostReferredText; node = node->next) {
            length += withPlainText || node->type == XML_ENTITY_REF_NODE ? costOfNode : 0;
            if (node->type == XML_ENTITY_REF_NODE) {
                length += __lengthOf(xmlGetDocEntity(node->doc, node->name));
            } else if (node->type == XML_ELEMENT_NODE) {
                for (const xmlAttr* attribute = node->properties; attribute; attribute = attribute->next) {
                    length += __lengthOf(attribute->children, withPlainText);
                }
                length += __lengthOf(node->children, withPlainText);
            } else if (withPlainText && node->content) {
                length += static_cast<size_t>(xmlStrlen(node->content));
            }
        }
        return length;
    }

    size_t __lengthOf(const xmlEntity* entity) {
        if (!entity) {
            return 0;
        }
        const auto known = lengths.find(entity);
        if (known != lengths.end()) {
            return known->second;
        }
        // Stands until the real length is known, so that an entity that holds itself ends the search.
        lengths[entity] = mostReferredText + 1;
        const size_t length = __lengthOf(entity->children, true);
        lengths[entity] = length;
        return length;
    }

    std::map<const xmlEntity*, size_t> lengths;
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

/// The text of a file that may be parsed. Its work is taken before it is done: also many files that are refused in the
/// end come to an end.
bool readAcceptedText(const std::string& path, KestLoadWork& work, std::string& text) {
    size_t size = 0;
    std::uint64_t weight = 0;
    return KestFiles::sizeOf(path, size) && size <= KestXmlLimits::longestFile && work.spendOnFile(size) &&
           KestFiles::read(path, size, text) && KestXmlLimits::accept(text, weight) && work.spendOnFile(weight);
}

/// An encoding in it would make another text of the one that was judged. With blanks in its place no other one can
/// stand at the beginning, which is where the parser heeds it.
void blankDeclaration(std::string& text) {
    const std::string begin = "<?xml";
    if (text.compare(0, begin.size(), begin) == 0 && text.find_first_of(" \t\r\n", begin.size()) == begin.size()) {
        const size_t end = text.find('>');
        const size_t length = end == std::string::npos ? text.size() : end + 1;
        text.replace(0, length, length, ' ');
    }
}

}  // namespace

bool KestXmlDocument::read(const std::string& path, KestLoadWork& work) {
    document.reset();
    std::string text;
    if (readAcceptedText(path, work, text)) {
        blankDeclaration(text);
        const Parsing parsing(text);
        document.reset(xmlReadFile(path.c_str(), "utf-8", recoverFromErrors));
    }
    if (!document) {
        return false;
    }
    xmlNode* root = xmlDocGetRootElement(document.get());
    // Without declarations of its own a document has no entity that stands for more than a character.
    if (document->intSubset) {
        const size_t referred = ReferredText().lengthIn(document.get());
        if (referred > mostReferredText || !work.spendOnFile(referred)) {
            removeReferences(root);
        }
    }
    return root && root->children;
}

const char* KestXmlDocument::failure() const {
    return document ? "Empty document" : "Failed to xmlReadFile";
}

xmlNode* KestXmlDocument::findSection(const char* name) const {
    xmlNode* node = xmlDocGetRootElement(document.get())->children;
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
    const xmlAttr* attribute = xmlHasProp(node, reinterpret_cast<const xmlChar*>(name));
    if (!attribute) {
        return Text(nullptr, freeText);
    }
    // Other than xmlGetProp() it takes no longer for a value of many references.
    const std::unique_ptr<xmlBuffer, void (*)(xmlBuffer*)> buffer(xmlBufferCreate(), xmlBufferFree);
    xmlNodeBufGetContent(buffer.get(), reinterpret_cast<const xmlNode*>(attribute));
    const xmlChar* value = xmlBufferContent(buffer.get());
    return Text(xmlStrdup(value ? value : reinterpret_cast<const xmlChar*>("")), freeText);
}
