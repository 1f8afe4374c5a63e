#pragma once

#include "PagerTest.h"

#include "KestContentMgr.h"

#include <device/Keys.h>

#include <string>
#include <vector>

/// What changes on the device while the pager is open, with no list beneath that would close it.
class PagerChange : public PagerTest {
protected:
    void openAtRest(int menu = 0) {
        open(menu);
        test_ui::runFor(1);
        newLog();
        calls::forget();
    }
    void setTheme(const std::string& theme) { device()->settings().set(device::keys::theme, theme); }
    /// Writes the catalogue anew and has it loaded, as whoever hears of a change does.
    void reload(const std::vector<std::string>& tips) const {
        writeTips(tips);
        KestContentMgr::getInstance()->loadContentsList(true);
    }
    static std::string titled(const std::string& title, const std::string& text = "Text") {
        return "<title>" + title + "</title>" + kest_files::contents(text);
    }
    void writeTranslatedTips() {
        const std::string tip =
            "<title id=\"IDS_MINE\">x</title>" + kest_files::contents(kest_files::textTag("IDS_BODY"));
        writeTips({tip, tip});
        for (const int index : {0, 1})
            writeStrings({{"en", "IDS_MINE", "Mine"},
                          {"ko", "IDS_MINE", "내 것"},
                          {"en", "IDS_BODY", "Read this"},
                          {"ko", "IDS_BODY", "읽으세요"}},
                         "contents/tip" + std::to_string(index) + "-string.xml");
    }
    std::string shownTitle(int index) { return test_ui::plainText(titleLabel(index)); }
    std::string shownText(int index) { return test_ui::plainText(entry(index)); }

    static kest_log::Line hit(const std::string& function) { return kest_log::hit(pager_log::pageFile, function); }
    static kest_log::Line error(const std::string& function, const std::string& message) {
        return kest_log::error(pager_log::pageFile, function, message);
    }
    static kest_log::Line display() { return kest_log::begin(pager_log::pageFile, "onViewDisplay"); }
};
