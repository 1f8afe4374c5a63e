#include "HostileFileTest.h"

using namespace manager_log;
using kest_files::contents;
using kest_files::detail;
using kest_files::Menu;
using testing::ElementsAre;
using testing::IsEmpty;

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

TEST_F(HostileFile, IsReadAsUtf8WhateverItSays) {
    writeMenus({{}});
    support::writeFile(detailFile(), "<?xml version=\"1.0\" encoding=\"iso-8859-1\"?>"
                                     "<tip><items><item><title>caf\u00e9</title></item></items></tip>");
    EXPECT_THAT(titles(load()), ElementsAre("caf\u00e9"));
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
    expectEmptyDetail();
}

TEST_F(HostileFile, MayBeginWithAByteOrderMark) {
    writeMenus({{}});
    support::writeFile(detailFile(), "\xef\xbb\xbf" + detail("<title>Title</title>"));
    // The parser does not take the mark where it is told the encoding.
    expectEmptyDetail();
}

TEST_F(HostileFile, MayBeCompressedAndIsNotUnpacked) {
    // "<tip><items><item><title>Title</title></item></items></tip>" as gzip, as xz and as lzma of two kinds.
    const std::vector<std::string> compressed = {
        "1f8b0800000000000003b329c92cb0b3c92c49cd2d8650763625992539a9762120d2461fc2b1d18748e94315ea83740100cdb97f413b00"
        "00"
        "00",
        "fd377a585a0000016922de360200210116000000742fe5a3e0003a00275d001e1d0927322065fdb23ba833d6710356fa1bba587cf30b01"
        "22"
        "3a23def233c134598450a28400000000cdb97f4100013f3b337653c99042990d010000000001595a",
        "5d00008000ffffffffffffffff001e1d0927322065fdb23ba833d6710356fa1bba587cf30b01223a23def233c134598450bd62257ffff2"
        "b4cc00",
        "0000000100ffffffffffffffff001e1efbe3f57e44cb783df246be10ffbf1856f460a12c6b6c90e4941e284af442f8087cd027e5b6ff38"
        "da4000"};
    for (const std::string& hex : compressed) {
        std::string bytes;
        for (std::size_t i = 0; i < hex.size(); i += 2)
            bytes += static_cast<char>(std::stoi(hex.substr(i, 2), nullptr, 16));
        writeMenus({{}});
        support::writeFile(detailFile(), bytes);
        EXPECT_EQ(load().at(0).menuTitle, "");
        EXPECT_THAT(errors(), ElementsAre(testing::AnyOf(error("__loadDetailMenu", "Failed to xmlReadFile"),
                                                         error("__loadDetailMenu", "Empty document"))));
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

TEST_F(HostileFile, LongDetailsOfManyTipsAreReadAsFarAsALoadGoes) {
    writeMenus(std::vector<Menu>(40));
    writeDetail("<title>Title</title><!--" + std::string(15 << 20, ' ') + "-->");
    const auto records = load();
    ASSERT_EQ(records.size(), 40U);
    EXPECT_EQ(records.front().menuTitle, "Title");
    EXPECT_EQ(records.back().menuTitle, "") << "a quarter of a gigabyte has been read by then";
    EXPECT_THAT(errors(), testing::Contains(error("__loadDetailMenu", "Failed to xmlReadFile")));
}

TEST_F(HostileFile, MainMenuMayHaveMoreMenusThanAnybodyScrollsThrough) {
    writeDetail("<title>Title</title>");
    setPreference("KestCurrentLanguage", "en_US.UTF-8");
    setPreference("KestPackageVersion", "1.0.0");
    writeMenus(std::vector<Menu>(20001));
    EXPECT_EQ(load(false).size(), 20000U);
    EXPECT_THAT(warnings(), ElementsAre(warning("__loadMainMenu", "only the first 20000 menus are read")));
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
