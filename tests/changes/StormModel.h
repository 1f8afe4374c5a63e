#pragma once

#include "Tips.h"

#include <map>
#include <string>
#include <vector>

/// What a catalogue and a user's doings ought to come to, told apart from how the application works.
class StormModel {
public:
    using Names = std::vector<std::string>;

    StormModel() { load(true); }

    // The device; it shows in the catalogue when that is loaded next.
    void setMenuFile(const Names& names) { menuFile_ = names; }
    void setCountry(const std::string& code) { region_ = code == "IN" ? "India" : "Global"; }
    void setInstalled(const std::string& appid, bool installed) { missing_[appid] = !installed; }
    bool isInstalled(const std::string& appid) const;
    void setLanguage(tips::Language language) { language_ = language; }
    tips::Language language() const { return language_; }

    /// Loads the catalogue; `force` reads all files, and otherwise texts come from the last time that they were read.
    void load(bool force);
    const Names& catalogue() const { return catalogue_; }

    /// The records that are due for a request.
    std::vector<std::string> requested(const std::string& appid, long page) const;
    /// The tip that shows after a request: the last one that it opened; "" when it opened none.
    std::string opened(const std::string& appid, long page) const;
    /// Whether its texts were read since it came into the catalogue.
    bool hasTexts(const std::string& name) const { return read_.count(name) > 0; }
    /// The record that is due for a row that was tapped; "" for a row without a tip.
    std::string chosen(int listIndex) const;

private:
    bool isOffered(const tips::Tip& tip) const;
    Names allOpened(const std::string& appid, long page) const;

    Names menuFile_ = tips::atFirst();
    std::string region_ = "Global";
    std::map<std::string, bool> missing_{{"com.example.weather", true}};
    tips::Language language_ = tips::Language::English;
    Names catalogue_;
    /// Titles as they were read last.
    std::map<std::string, std::string> read_;
};
