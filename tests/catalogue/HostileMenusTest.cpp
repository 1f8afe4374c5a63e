#include "HostileTest.h"
#include "PreferenceCalls.h"
#include "ProcessorClock.h"

using kest_files::contents;
using kest_files::detail;

/// Many menus that share files which are slow to read or long to keep.
class HostileMenus : public HostileTest {
protected:
    static constexpr std::size_t megabyte = 1024 * 1024;

    /// So many menus with the detail file of that path and text.
    void writeShared(std::size_t count, const std::string& text, const std::string& path = tipPath) {
        writeMenus(std::vector<kest_files::Menu>(count, kest_files::Menu{path, "com.ravella.kest", "Global"}));
        support::writeFile(resources() / path, text);
    }
    static std::size_t sizeOf(const std::vector<KestContentInfo>& records) {
        std::size_t size = 0;
        for (const KestContentInfo& record : records)
            size += record.menuTitle.size() + record.textContents.size();
        return size;
    }
};

TEST_F(HostileMenus, MayShareAFileThatIsLongToRead) {
    writeShared(20000, "<tip><!--" + std::string(15 * megabyte, 'x') + "--></tip>");
    EXPECT_EQ(load().size(), 20000U);
}

TEST_F(HostileMenus, MayShareAFileThatIsSlowToParse) {
    // Its own string file, since its name does not end in .xml.
    writeShared(20000, "<tip " + std::string(15 * megabyte, 'x'), "contents/tip");
    EXPECT_EQ(load().size(), 20000U);
}

TEST_F(HostileMenus, MayShareAFileThatIsRefused) {
    writeShared(20000, "<tip>" + repeated("<x/>", 3500000) + "</tip>");
    EXPECT_EQ(load().size(), 20000U);
}

TEST_F(HostileMenus, MayShareAFileWithADocumentTypeThatIsSlowToParse) {
    std::string attributes;
    for (int i = 0; i < 6000; ++i)
        attributes += " a" + std::to_string(i) + "&#61;''";
    writeShared(20000, "<!DOCTYPE tip [<!ENTITY e \"&#60;x" + attributes + "/>\">]><tip><items>&e;</items></tip>");
    EXPECT_EQ(load().size(), 20000U);
}

TEST_F(HostileMenus, MayShareLongContents) {
    writeShared(3000, detail("<title>Title</title>" + contents(std::string(megabyte, 'x'))));
    for (const bool fromFiles : {true, false}) {
        const auto records = load(fromFiles);
        EXPECT_EQ(records.at(0).textContents.size(), megabyte);
        EXPECT_LE(sizeOf(records), 64 * megabyte);
        EXPECT_EQ(records.at(2999).textContents, "");
        EXPECT_THAT(warnings(), testing::Contains(manager_log::warning("__keep", "too much text: " + tipPath)));
    }
}

TEST_F(HostileMenus, ThatAreNotKeptHaveTheirIcons) {
    writeShared(70, detail(contents(std::string(megabyte, 'x'))));
    const auto records = load();
    EXPECT_EQ(records.at(69).textContents, "");
    EXPECT_EQ(records.at(69).iconPath, records.at(0).iconPath);
    EXPECT_NE(records.at(69).iconPath, "");
    EXPECT_EQ(records.at(69).path, tipPath);
}

TEST_F(HostileMenus, MayShareContentsFullOfReferences) {
    writeShared(25, detail(contents(repeated("href=file:", 250000))));
    EXPECT_LE(sizeOf(load()), 64 * megabyte);
}

TEST_F(HostileMenus, AreLeftAsTheyAreOnceALoadHasTakenTooLong) {
    writeMenus({{}, {"contents/other.xml"}});
    writeDetail("<title>Title</title>");
    writeDetail("<title>Other</title>", "contents/other.xml");
    preference_calls::meanwhile["contents_tip.xml_menuTitle"] = [] { processor_clock::ahead = 11; };
    const auto records = load();
    processor_clock::ahead = 0;
    preference_calls::meanwhile.clear();
    EXPECT_EQ(records.at(1).menuTitle, "");
    EXPECT_THAT(errors(), testing::ElementsAre(manager_log::error("__loadDetailMenu", "Failed to xmlReadFile")));
    EXPECT_EQ(load().at(1).menuTitle, "Other");
}
