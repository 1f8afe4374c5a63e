#include "StormModel.h"

bool StormModel::isInstalled(const std::string& appid) const {
    const auto found = missing_.find(appid);
    return found == missing_.end() || !found->second;
}

bool StormModel::isOffered(const tips::Tip& tip) const {
    return isInstalled(tip.appid) && tip.regions.find(region_) != std::string::npos;
}

void StormModel::load(bool force) {
    catalogue_.clear();
    for (const std::string& name : tips::with(tips::with(menuFile_, "Weather"), "Cricket")) {
        if (!isOffered(tips::named(name)))
            continue;
        catalogue_.push_back(name);
        if (force)
            read_[name] = tips::title(name, language_);
    }
}

StormModel::Names StormModel::allOpened(const std::string& appid, long page) const {
    Names opened;
    for (const std::string& name : catalogue_) {
        if (tips::named(name).appid != appid)
            continue;
        if (page > 1)
            --page;
        else
            opened.push_back(name);
    }
    return opened;
}

std::string StormModel::opened(const std::string& appid, long page) const {
    const Names all = allOpened(appid, page);
    return all.empty() ? "" : all.back();
}

std::vector<std::string> StormModel::requested(const std::string& appid, long page) const {
    std::vector<std::string> records;
    for (const std::string& name : allOpened(appid, page)) {
        const auto title = read_.find(name);
        records.push_back("KT03 " + (title == read_.end() ? "" : title->second));
    }
    return records;
}

std::string StormModel::chosen(int listIndex) const {
    const auto menu = static_cast<std::size_t>(listIndex) - 2;
    if (menu >= catalogue_.size())
        return "";
    const auto title = read_.find(catalogue_[menu]);
    return "KT01 " + (title == read_.end() ? "" : title->second);
}
