#include "KestMenuElement.h"

#include "KestCommon.h"
#include "KestXmlDocument.h"

KestContentInfo KestMenuElement::read(const xmlNode* menu) {
    KestContentInfo record;
    for (xmlNode* node = menu->children; node; node = node->next) {
        const std::string text = KestXmlDocument::str(KestXmlDocument::content(node));
        if (KestXmlDocument::isElement(node, "path")) {
            record.path = text;
        } else if (KestXmlDocument::isElement(node, "appid")) {
            record.appid = text;
        } else if (KestXmlDocument::isElement(node, "state")) {
            record.isAvailable = text != "NOK" && text.find(KestCommon::getRegion()) != std::string::npos;
        }
    }
    return record;
}
