#pragma once

#include "KestContentInfo.h"
#include "KestLoadWork.h"
#include "KestMarkup.h"
#include "KestSharedResources.h"
#include "KestTranslator.h"

#include <libxml/tree.h>

#include <string>
#include <vector>

/// The catalogue manager: reads the catalogue of tip menus, translates it, caches it in the application's
/// preferences and hands it out. One instance a process; only the main loop's thread calls it.
/// It draws nothing and tells nobody of a change: who reloads it refreshes the views.
class KestContentMgr {
public:
    /// The single instance. The first call builds it, which loads the catalogue.
    static KestContentMgr* getInstance();
    virtual ~KestContentMgr();
    KestContentMgr(const KestContentMgr&) = delete;
    KestContentMgr& operator=(const KestContentMgr&) = delete;

    /// Builds the catalogue anew: from the preference cache where that is valid, unless `force` is true.
    /// False when the main menu file could not be read; the catalogue is empty then.
    bool loadContentsList(bool force);

    /// The menus offered in the device's region, in the order of the main menu file. A view takes a copy: the
    /// sequence itself is replaced by the next load.
    const std::vector<KestContentInfo>& getContentsList() const { return contentsList; }

private:
    KestContentMgr();

    // The main menu file and the detail files.
    std::string __detailPath(const KestContentInfo& record) { return sharedResources.of(record.appid) + record.path; }
    bool __loadMainMenu();
    bool __loadDetailMenu(KestContentInfo& record);
    void __readDetail(xmlNode* node, KestContentInfo& record);
    /// Leaves the record without its texts where the load keeps too many already.
    void __keep(KestContentInfo& record);
    /// `cleaned` is the element's text without what old contents have too much.
    void __setContents(KestContentInfo& record, const std::string& text, const std::string& cleaned);
    static std::string __replaceString(const std::string& text, const std::string& from, const std::string& to,
                                       bool firstOnly) {
        return KestMarkup::replaceString(text, from, to, firstOnly);
    }
    static std::string __extractString(const std::string& text, const std::string& start, const std::string& end,
                                       bool inclusive) {
        return KestMarkup::extractString(text, start, end, inclusive);
    }
    /// With the paths of files that are relative to the application's shared resources made absolute.
    std::string __convertHrefPath(const std::string& appid, const std::string& text);

    // String resources and translation.
    void __loadStringResource(const KestContentInfo& record);
    /// The translation of the node's "id" attribute, which goes to `usedId`; `text` where there is none.
    std::string __translateById(xmlNode* node, const std::string& domain, const std::string& text, std::string& usedId);
    bool __isStringAvailable(const std::string& id, const std::string& domain) const {
        return translator.knows(id, domain);
    }
    std::string __getString(const std::string& id, const std::string& domain) const {
        return translator.translate(id, domain);
    }
    std::string __translateContents(const std::string& domain, const std::string& contents);

    // The preference cache and what decides whether it is valid.
    bool __checkCacheAvailable();
    std::string __getPackageVersion();
    std::string __getIconPath(const std::string& appid);
    void __saveToPreference(const KestContentInfo& record);
    void __getFromPreference(const std::string& path, KestContentInfo& record);

    std::vector<KestContentInfo> contentsList;
    /// Of the load that goes on.
    KestLoadWork work;
    /// With the string table, which is kept over loads.
    KestTranslator translator;
    /// As this load has met them.
    KestSharedResources sharedResources;
};
