#include "HostileFileTest.h"

using namespace manager_log;
using kest_files::contents;
using kest_files::detail;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

TEST_F(HostileFile, MainMenuMayBeAFolder) {
    std::filesystem::create_directories(mainMenuFile());
    expectNoMainMenu();
}

TEST_F(HostileFile, MainMenuMayBeAFifo) {
    makeFifo(mainMenuFile());
    expectNoMainMenu();
}

TEST_F(HostileFile, MainMenuMayBeADevice) {
    std::filesystem::create_directories(mainMenuFile().parent_path());
    std::filesystem::create_symlink("/dev/zero", mainMenuFile());
    expectNoMainMenu();
}

TEST_F(HostileFile, MainMenuMayBeALinkToNothing) {
    std::filesystem::create_directories(mainMenuFile().parent_path());
    std::filesystem::create_symlink("nothing", mainMenuFile());
    EXPECT_THAT(load(), IsEmpty());
    EXPECT_THAT(errors(), ElementsAre(error("__loadMainMenu", "Failed to access: -1, " + mainMenuFile().string())));
}

TEST_F(HostileFile, MainMenuMayBeUnreadable) {
    writeMenus({});
    const Unreadable unreadable(device(), mainMenuFile());
    expectNoMainMenu();
}

TEST_F(HostileFile, DetailMayBeAFolder) {
    std::filesystem::create_directories(detailFile());
    expectNoDetail();
}

TEST_F(HostileFile, DetailMayBeAFifo) {
    makeFifo(detailFile());
    expectNoDetail();
}

TEST_F(HostileFile, DetailMayBeOfSixteenMebibytesAndNoLonger) {
    writeMenus({{}});
    const std::string begin = "<tip><items><item><title>Title</title></item></items><!--";
    const std::string end = "--></tip>";
    const std::size_t rest = (std::size_t{16} << 20) - begin.size() - end.size();
    // The parser takes no comment of more than ten megabytes.
    std::string comments = repeated("-->" + std::string(1017, ' ') + "<!--", rest / 1024);
    comments.resize(rest, 'x');
    support::writeFile(detailFile(), begin + comments + end);
    EXPECT_THAT(titles(load()), ElementsAre("Title"));
    support::writeFile(detailFile(), begin + comments + "x" + end);
    EXPECT_THAT(titles(load()), ElementsAre(""));
    EXPECT_THAT(errors(), Contains(error("__loadDetailMenu", "Failed to xmlReadFile")));
}

TEST_F(HostileFile, DetailMaySayThatItIsEmptyAndKeepItsReaderWaiting) {
    writeMenus({{}});
    // It is a regular file of no bytes by its status, and a stream without an end by its contents.
    std::filesystem::create_directories(detailFile().parent_path());
    std::filesystem::create_symlink("/proc/kmsg", detailFile());
    EXPECT_THAT(titles(load()), ElementsAre(""));
    EXPECT_THAT(errors(), Contains(error("__loadDetailMenu", "Failed to xmlReadFile")));
}

TEST_F(HostileFile, DetailMayBeUnreadable) {
    writeMenus({{}});
    writeDetail("<title>Title</title>");
    const Unreadable unreadable(device(), detailFile());
    const auto records = load();
    ASSERT_EQ(records.size(), 1U);
    EXPECT_EQ(records[0].menuTitle, "");
    EXPECT_THAT(errors(), Contains(error("__loadDetailMenu", "Failed to xmlReadFile")));
}

TEST_F(HostileFile, DetailMayBeTheFolderOfAllResources) {
    writeMenus({{"", kest}});
    const auto records = load();
    ASSERT_EQ(records.size(), 1U);
    EXPECT_EQ(records[0].path, "");
    // The string file of no path is that folder too.
    EXPECT_THAT(errors(), ElementsAre(error("__loadStringResource", "Failed to xmlReadFile"),
                                      error("__loadDetailMenu", "Failed to xmlReadFile")));
}

TEST_F(HostileFile, StringsMayBeAFolder) {
    std::filesystem::create_directories(stringFile());
    expectNoStrings();
}

TEST_F(HostileFile, StringsMayBeAFifo) {
    makeFifo(stringFile());
    expectNoStrings();
}

TEST_F(HostileFile, StringsMayBeUnreadable) {
    writeTip("<title id=\"IDS_MINE\">untranslated</title>");
    writeStrings({{"en", "IDS_MINE", "Mine"}});
    const Unreadable unreadable(device(), stringFile());
    EXPECT_THAT(titles(load()), ElementsAre("untranslated"));
    EXPECT_THAT(errors(), Contains(error("__loadStringResource", "Failed to xmlReadFile")));
}

TEST_F(HostileFile, PathMayLeadOutOfTheResources) {
    // The catalogue's author is trusted with paths: one that leads elsewhere is read there, or dropped.
    support::writeFile(device().folder() / "outside.xml", detail("<title>Outside</title>"));
    writeMenus({{"../../../../outside.xml"}, {"../../../../../../../../../../../etc"}, {"../nowhere.xml"}});
    const auto records = load();
    EXPECT_THAT(titles(records), ElementsAre("Outside", ""));
    EXPECT_EQ(preference(".._.._.._.._outside.xml_menuTitle"), "Outside");
    EXPECT_THAT(warnings(), ElementsAre(warning("__loadMainMenu", "__loadMainMenu failed : " + kest)));
}

TEST_F(HostileFile, PathMayBeLongerThanAnyFilesName) {
    writeMenus({{repeated("a", 100000)}, {}});
    writeDetail("<title>Title</title>");
    EXPECT_THAT(titles(load()), ElementsAre("Title"));
    EXPECT_EQ(warnings().size(), 1U);
}

TEST_F(HostileFile, ApplicationsIdMayLeadOutOfThePackages) {
    support::writeFile(device().folder() / "shared/res/contents/tip.xml", detail("<title>Outside</title>"));
    for (const char* appid : {"..", "../..", "/", ".", "a/b", "com.example.\n", "%s%n"}) {
        writeMenus({{tipPath, appid}});
        EXPECT_THAT(load(), IsEmpty()) << appid;
        EXPECT_THAT(warnings(), ElementsAre(testing::Field(&kest_log::Line::function, "__loadMainMenu"))) << appid;
    }
}

TEST_F(HostileFile, TextsMayHoldPercentSigns) {
    writeMenus({{"%s%n.xml", "com.%s%n"}});
    load();
    EXPECT_THAT(warnings(), ElementsAre(warning("__loadMainMenu", "__loadMainMenu failed : com.%s%n")));
}

TEST_F(HostileFile, PictureMayBeAnything) {
    makeFifo(resources() / "a.png");
    EXPECT_EQ(loadTip("<image>a.png</image>").imagePath, (resources() / "a.png").string());
    EXPECT_EQ(loadTip("<image>../../x</image>").imagePath, resources().string() + "/../../x");
}

TEST_F(HostileFile, MayEndAnywhere) {
    const std::string whole = detail("<textdomain>tips</textdomain><title id=\"IDS_OWN\">T</title>" +
                                     contents("<item a></item>" + kest_files::textTag("IDS_OWN") + "<br/>x") +
                                     "<attach id=\"x\"><![CDATA[<item href=file:y></item>]]></attach>");
    writeMenus({{}});
    for (std::size_t length = 0; length <= whole.size(); length += 3) {
        support::writeFile(detailFile(), whole.substr(0, length));
        support::writeFile(stringFile(), whole.substr(0, length));
        EXPECT_EQ(load().size(), 1U) << length;
    }
}

TEST_F(HostileFile, MainMenuMayEndAnywhere) {
    const std::string whole = kest_files::mainMenu({{}, {"contents/other.xml"}});
    writeDetail("<title>Title</title>");
    for (std::size_t length = 0; length <= whole.size(); length += 3) {
        support::writeFile(mainMenuFile(), whole.substr(0, length));
        EXPECT_LE(load().size(), 2U) << length;
    }
}
