#include "KestXml.h"

#include <sys/stat.h>

#include <map>

namespace {

const int recoverFromErrors = 1;

/// More text than any element of a catalogue has; past it an element counts as empty.
const size_t longestText = 16 * 1024 * 1024;

void freeText(xmlChar* text) {
    xmlFree(text);
}

bool isRegularFile(const std::string& path) {
    struct stat status;
    return stat(path.c_str(), &status) == 0 && S_ISREG(status.st_mode);
}

/// How long the text of a node becomes when the entities that the file declares are put in. A few kilobytes of
/// nested declarations can stand for gigabytes, which the parser does not notice while it only refers to them.
class ExpandedLength {
public:
    size_t of(const xmlNode* node) {
        size_t length = 0;
        for (const xmlNode* child = node->children; child && length <= longestText; child = child->next) {
            length += ofSingle(child);
        }
        return length;
    }

private:
    size_t ofSingle(const xmlNode* node) {
        switch (node->type) {
        case XML_TEXT_NODE:
        case XML_CDATA_SECTION_NODE:
            return node->content ? static_cast<size_t>(xmlStrlen(node->content)) : 0;
        case XML_ENTITY_REF_NODE:
            return ofEntity(xmlGetDocEntity(node->doc, node->name));
        case XML_ELEMENT_NODE:
            return of(node);
        default:
            return 0;
        }
    }

    size_t ofEntity(const xmlEntity* entity) {
        if (!entity) {
            return 0;
        }
        const auto known = entities_.find(entity);
        if (known != entities_.end()) {
            return known->second;
        }
        // Stands until the real length is known, so that an entity that holds itself ends the search.
        entities_[entity] = longestText + 1;
        const size_t length = of(reinterpret_cast<const xmlNode*>(entity));
        entities_[entity] = length;
        return length;
    }

    std::map<const xmlEntity*, size_t> entities_;
};

bool isTooLong(const xmlNode* node) {
    const bool declaresEntities = node->doc && node->doc->intSubset && node->doc->intSubset->entities;
    return declaresEntities && ExpandedLength().of(node) > longestText;
}

}  // namespace

KestXmlDocument::Result KestXmlDocument::read(const std::string& path) {
    document_.reset(isRegularFile(path) ? xmlReadFile(path.c_str(), "utf-8", recoverFromErrors) : nullptr);
    if (!document_) {
        return Result::NotRead;
    }
    const xmlNode* root = xmlDocGetRootElement(document_.get());
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
    return node->type == XML_ELEMENT_NODE && hasName(node, name);
}

bool KestXmlDocument::hasName(const xmlNode* node, const char* name) {
    return node->name && xmlStrcmp(node->name, reinterpret_cast<const xmlChar*>(name)) == 0;
}

KestXmlDocument::Text KestXmlDocument::content(xmlNode* node) {
    return Text(isTooLong(node) ? nullptr : xmlNodeGetContent(node), freeText);
}

KestXmlDocument::Text KestXmlDocument::attribute(xmlNode* node, const char* name) {
    const xmlAttr* found = xmlHasProp(node, reinterpret_cast<const xmlChar*>(name));
    const bool usable = found && !isTooLong(reinterpret_cast<const xmlNode*>(found));
    return Text(usable ? xmlGetProp(node, found->name) : nullptr, freeText);
}
