#include "KestStringTable.h"

#include "KestXml.h"

void KestStringTable::add(const xmlNode* item) {
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
        values_[region + "_" + stringId] = value;
    }
}

const std::string* KestStringTable::find(const std::string& language, const std::string& id) const {
    const size_t countryLength = 5;
    const size_t languageLength = 2;
    for (const size_t length : {countryLength, languageLength}) {
        const auto entry = values_.find(language.substr(0, length) + "_" + id);
        if (entry != values_.end()) {
            return &entry->second;
        }
    }
    return nullptr;
}
