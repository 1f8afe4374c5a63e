// What the catalogue manager does to one text of a tip.
#include "KestContentMgr.h"
#include "KestLog.h"
#include "KestMarkup.h"
#include "KestXmlDocument.h"
#include "KestXmlLimits.h"

void KestContentMgr::__attach(KestContentInfo& record, const std::string& placeholder, const std::string& fragment) {
    const size_t size = record.textContents.size() + fragment.size();
    if (size > KestXmlLimits::longestFile || !work.spendOnText(KestLoadWork::ofMoving(size))) {
        KEST_WARN("too much to attach: %s", record.path.c_str());
        return;
    }
    const size_t found = KestMarkup::find(record.textContents, placeholder, 0);
    if (found != std::string::npos) {
        record.textContents.replace(found, placeholder.size(), fragment);
    }
}

std::string KestContentMgr::__translateById(xmlNode* node, const std::string& domain, const std::string& text,
                                            std::string& usedId) {
    const KestXmlDocument::Text id = KestXmlDocument::attribute(node, "id");
    const std::string name = KestXmlDocument::str(id);
    if (!id || !work.spendOnText(0) || !__isStringAvailable(name, domain)) {
        return text;
    }
    std::string translation = __getString(name, domain);
    if (!work.spendOnText(KestLoadWork::ofTranslating(translation.size()))) {
        return text;
    }
    usedId = name;
    return translation;
}

void KestContentMgr::__setContents(KestContentInfo& record, const std::string& text, const std::string& cleaned) {
    const std::string translated = __translateContents(record.textdomain, cleaned);
    record.textContents = __convertHrefPath(record.appid, translated);
    if (record.textContents.empty()) {
        record.textContents = text;
    }
}

std::string KestContentMgr::__convertHrefPath(const std::string& appid, const std::string& text) {
    const std::string reference = "href=file:";
    // The directory begins with a slash itself; the text engine expects both.
    const std::string converted = "href=file:/" + sharedResources.of(appid);
    const std::uint64_t growth = KestMarkup::count(text, reference) * std::uint64_t(converted.size());
    if (growth > KestXmlLimits::longestFile || !work.spendOnText(text.size() + growth)) {
        KEST_WARN("too many references to files: %s", appid.c_str());
        return text;
    }
    return __replaceString(text, reference, converted, false);
}
