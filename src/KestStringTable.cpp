#include "KestStringTable.h"

#include "KestXmlDocument.h"

void KestStringTable::addAll(const xmlNode* items) {
    for (const xmlNode* item = items->children; item; item = item->next) {
        if (KestXmlDocument::isElement(item, "item")) {
            __add(item);
        }
    }
}

void KestStringTable::__add(const xmlNode* item) {
    std::string region;
    std::string stringId;
    std::string value;
    for (xmlNode* node = item->children; node; node = node->next) {
        if (KestXmlDocument::isElement(node, "region")) {
            region = KestXmlDocument::str(KestXmlDocument::content(node));
        } else if (KestXmlDocument::isElement(node, "stringid")) {
            stringId = KestXmlDocument::str(KestXmlDocument::content(node));
        } else if (KestXmlDocument::isElement(node, "value")) {
            value = KestXmlDocument::str(KestXmlDocument::content(node));
        }
    }
    if (!stringId.empty()) {
        values[region + "_" + stringId] = value;
    }
}

const std::string* KestStringTable::find(const std::string& language, const std::string& id) const {
    const size_t countryLength = 5;
    const size_t languageLength = 2;
    for (const size_t length : {countryLength, languageLength}) {
        const auto entry = values.find(language.substr(0, length) + "_" + id);
        if (entry != values.end()) {
            return &entry->second;
        }
    }
    return nullptr;
}
