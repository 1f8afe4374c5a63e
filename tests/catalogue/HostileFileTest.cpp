#include "HostileTest.h"

#include <unistd.h>

#include <fstream>

using namespace manager_log;
using kest_files::contents;
using kest_files::detail;
using kest_files::Menu;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

class HostileFile : public HostileTest {
protected:
    std::filesystem::path detailFile() const { return resources() / tipPath; }
    std::filesystem::path stringFile() const { return resources() / "contents/tip-string.xml"; }

    /// Expects the main menu file to be there and of no use.
    void expectNoMainMenu() {
        EXPECT_THAT(load(), IsEmpty());
        EXPECT_FALSE(result());
        EXPECT_THAT(errors(), ElementsAre(error("__loadMainMenu", "Failed to xmlReadFile")));
    }
    /// Expects the tip to keep its place without its texts.
    void expectNoDetail() {
        writeMenus({{}});
        const auto records = load();
        EXPECT_TRUE(result());
        ASSERT_EQ(records.size(), 1U);
        EXPECT_EQ(records[0].menuTitle, "");
        EXPECT_THAT(errors(), ElementsAre(error("__loadDetailMenu", "Failed to xmlReadFile")));
        EXPECT_THAT(log(), Contains(info("loadContentsList", "__loadDetailMenu failed : " + kest)));
    }
    /// Expects the tip to do without its string file.
    void expectNoStrings() {
        EXPECT_EQ(loadTip("<title id=\"IDS_MINE\">untranslated</title>").menuTitle, "untranslated");
        EXPECT_THAT(errors(), ElementsAre(error("__loadStringResource", "Failed to xmlReadFile")));
        EXPECT_TRUE(result());
    }
    /// Nobody may read the file: not even the superuser, as long as this lives.
    class Unreadable {
    public:
        Unreadable(const support::TemporaryDevice& device, const std::filesystem::path& file) {
            namespace fs = std::filesystem;
            fs::permissions(file, fs::perms::none);
            if (geteuid() == 0) {
                for (const fs::path& folder : {device.folder(), device.root()})
                    fs::permissions(folder, fs::perms::all);
                const fs::path log = device::Folder(device.root()).log();
                std::ofstream(log, std::ios::app).flush();
                fs::permissions(log, fs::perms::all);
                constexpr uid_t nobody = 65534;
                became_ = seteuid(nobody) == 0;
            }
        }
        ~Unreadable() {
            if (became_ && seteuid(0) != 0)
                std::abort();
        }

    private:
        bool became_ = false;
    };
};

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

TEST_F(HostileFile, MayHoldZeroBytes) {
    writeMenus({{}});
    const std::string text = detail("<title>before\1after</title>");
    const std::string zeroed = std::string(text).replace(text.find('\1'), 1, 1, '\0');
    support::writeFile(detailFile(), zeroed);
    support::writeFile(stringFile(), zeroed);
    EXPECT_THAT(titles(load()), ElementsAre("before"));
    support::writeFile(mainMenuFile(), std::string(1000, '\0'));
    EXPECT_THAT(load(), IsEmpty());
}

TEST_F(HostileFile, MayBeOfAnotherEncodingThanItSays) {
    writeMenus({{}});
    support::writeFile(detailFile(), detail("<title>caf\xe9</title><appname>Name</appname>"));
    support::writeFile(stringFile(), detail("\xff\xfe\x80"));
    EXPECT_EQ(load().at(0).appName, "Name");
}

TEST_F(HostileFile, MayBeOfSixteenBits) {
    writeMenus({{}});
    std::string wide = "\xff\xfe";
    for (const char c : detail("<title>Title</title>"))
        wide += {c, '\0'};
    support::writeFile(detailFile(), wide);
    EXPECT_EQ(load().size(), 1U);
}

TEST_F(HostileFile, MayBeginWithAByteOrderMark) {
    writeMenus({{}});
    support::writeFile(detailFile(), "\xef\xbb\xbf" + detail("<title>Title</title>"));
    // The parser does not take the mark where it is told the encoding.
    EXPECT_EQ(load().size(), 1U);
}

TEST_F(HostileFile, MayBeCompressedAndIsNotUnpacked) {
    // "<tip><items><item><title>Title</title></item></items></tip>" as gzip and as xz.
    const std::vector<std::string> compressed = {
        "1f8b0800000000000003b329c92cb0b3c92c49cd2d8650763625992539a9762120d2461fc2b1d18748e94315ea83740100cdb97f413b00"
        "00"
        "00",
        "fd377a585a0000016922de360200210116000000742fe5a3e0003a00275d001e1d0927322065fdb23ba833d6710356fa1bba587cf30b01"
        "22"
        "3a23def233c134598450a28400000000cdb97f4100013f3b337653c99042990d010000000001595a"};
    for (const std::string& hex : compressed) {
        std::string bytes;
        for (std::size_t i = 0; i < hex.size(); i += 2)
            bytes += static_cast<char>(std::stoi(hex.substr(i, 2), nullptr, 16));
        support::writeFile(detailFile(), bytes);
        expectNoDetail();
    }
}

TEST_F(HostileFile, MayBeLargerThanADevicesMemory) {
    support::writeFile(detailFile(), detail("<title>Title</title>") + std::string(65 << 20, '\n'));
    expectNoDetail();
}

TEST_F(HostileFile, TextsDomainMayLeadToAFifo) {
    const std::filesystem::path fifo = device().folder() / "pipe";
    makeFifo(fifo.string() + ".mo");
    const std::string domain = repeated("../", 30) + fifo.relative_path().string();
    EXPECT_EQ(loadTip("<textdomain>" + domain + "</textdomain><title id=\"IDS_X\">x</title>" +
                      contents(kest_files::textTag("IDS_X") + kest_files::textTag("IDS_SYSTEM")))
                  .textContents,
              "IDS_XSystem text");
}

TEST_F(HostileFile, MayBeFullOfErrors) {
    testing::internal::CaptureStderr();
    writeMenus({{}});
    support::writeFile(detailFile(), detail("<title>Title</title>" + repeated("<a b=c>&nothing;</d>", 20000)));
    EXPECT_EQ(load().size(), 1U);
    testing::internal::GetCapturedStderr();
}

TEST_F(HostileFile, MayBeDeep) {
    testing::internal::CaptureStderr();
    writeMenus({{}});
    support::writeFile(detailFile(), repeated("<a>", 200000) + "x" + repeated("</a>", 200000));
    support::writeFile(stringFile(), repeated("<a>", 200000));
    EXPECT_EQ(load().size(), 1U);
    support::writeFile(mainMenuFile(), "<tips><menus>" + repeated("<menu>", 200000));
    EXPECT_THAT(load(), IsEmpty());
    testing::internal::GetCapturedStderr();
}

TEST_F(HostileFile, MayHaveOneLineOfMegabytes) {
    const std::string line = repeated("lorem ipsum ", 400000);
    EXPECT_EQ(loadContents(line), line);
    const std::string title = repeated("x", 5000000);
    EXPECT_EQ(loadTip("<title>" + title + "</title>").menuTitle, title);
    EXPECT_EQ(load(false).at(0).menuTitle, title);
}

TEST_F(HostileFile, MainMenuMayHave15000Menus) {
    writeDetail("<title>Title</title>");
    writeMenus(std::vector<Menu>(15000));
    EXPECT_EQ(load(false).size(), 15000U);
    EXPECT_TRUE(result());
}

TEST_F(HostileFile, MainMenuMayHaveAMillionMenusThatAreNotOffered) {
    writeDetail("<title>Title</title>");
    support::writeFile(mainMenuFile(), kest_files::mainMenu(repeated("<menu/>", 1000000) + Menu{}.xml()));
    EXPECT_EQ(load().size(), 1U);
}

TEST_F(HostileFile, StringsMayBeAHundredThousand) {
    std::vector<kest_files::String> strings;
    for (int i = 0; i < 100000; ++i)
        strings.push_back({"en", "IDS_" + std::to_string(i), "value"});
    writeStrings(strings);
    EXPECT_EQ(loadTip("<title id=\"IDS_99999\">untranslated</title>").menuTitle, "value");
}
