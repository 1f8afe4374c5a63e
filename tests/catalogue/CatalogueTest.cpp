#include "CatalogueTest.h"

CatalogueTest::CatalogueTest(bool withManager) {
    if (withManager)
        KestContentMgr::getInstance();
    kest_texts::start(device::keys::defaultLanguage);
}

void CatalogueTest::setLanguage(const std::string& language) {
    device()->settings().set(device::keys::language, language);
    kest_texts::useLanguage(language);
}

void CatalogueTest::setCountry(const std::string& country) {
    device()->settings().set(device::keys::country, country);
}

std::vector<KestContentInfo> CatalogueTest::load(bool force) {
    KestContentMgr* manager = KestContentMgr::getInstance();
    const std::size_t before = kest_log::all(device()).size();
    result_ = manager->loadContentsList(force);
    const std::vector<kest_log::Line> lines = kest_log::all(device());
    log_.assign(lines.begin() + static_cast<std::ptrdiff_t>(before), lines.end());
    return manager->getContentsList();
}

KestContentInfo CatalogueTest::loadTip(const std::string& item) {
    writeTip(item);
    const auto records = load();
    if (records.size() != 1)
        throw std::runtime_error("the catalogue has " + std::to_string(records.size()) + " menus instead of one");
    return records.front();
}

std::vector<std::string> CatalogueTest::titles(const std::vector<KestContentInfo>& records) {
    std::vector<std::string> all;
    for (const KestContentInfo& record : records)
        all.push_back(record.menuTitle);
    return all;
}

std::vector<std::string> CatalogueTest::paths(const std::vector<KestContentInfo>& records) {
    std::vector<std::string> all;
    for (const KestContentInfo& record : records)
        all.push_back(record.path);
    return all;
}
