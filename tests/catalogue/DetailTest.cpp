#include "CatalogueTest.h"

using namespace manager_log;
using kest_files::contents;
using testing::ElementsAre;
using testing::IsEmpty;

class Detail : public CatalogueTest {
protected:
    /// Loads a tip whose detail file holds exactly that.
    KestContentInfo loadFile(const std::string& text) {
        writeMenus({{}});
        support::writeFile(resources() / tipPath, text);
        return load().at(0);
    }
    std::string detailFile() const { return (resources() / tipPath).string(); }
};

TEST_F(Detail, FillsTheRecord) {
    const KestContentInfo record =
        loadTip("<textdomain>tips</textdomain><title>Title</title><appname>Name</appname><image>images/a.png</image>"
                "<launchappid>com.example.app</launchappid><launchparamkey>key</launchparamkey>"
                "<launchparamvalue>value</launchparamvalue>" +
                contents("Text"));
    EXPECT_EQ(record.path, tipPath);
    EXPECT_EQ(record.appid, kest);
    EXPECT_TRUE(record.isAvailable);
    EXPECT_EQ(record.menuTitle, "Title");
    EXPECT_EQ(record.titleId, "");
    EXPECT_EQ(record.textContents, "Text");
    EXPECT_EQ(record.imagePath, (resources() / "images/a.png").string());
    EXPECT_EQ(record.textdomain, "tips");
    EXPECT_EQ(record.iconPath, device()->packages().find(kest)->icon);
    EXPECT_EQ(record.appName, "Name");
    EXPECT_EQ(record.launchAppid, "com.example.app");
    EXPECT_EQ(record.launchParamKey, "key");
    EXPECT_EQ(record.launchParamValue, "value");
}

TEST_F(Detail, TakesItsTextsAsTheyStand) {
    const KestContentInfo record =
        loadTip("<textdomain> tips </textdomain><appname> Name </appname><image> a.png </image>"
                "<launchappid> com.example.app </launchappid><launchparamkey> key </launchparamkey>"
                "<launchparamvalue> value </launchparamvalue>");
    EXPECT_EQ(record.textdomain, " tips ");
    EXPECT_EQ(record.appName, " Name ");
    EXPECT_EQ(record.imagePath, resources().string() + "/ a.png ");
    EXPECT_EQ(record.launchAppid, " com.example.app ");
    EXPECT_EQ(record.launchParamKey, " key ");
    EXPECT_EQ(record.launchParamValue, " value ");
}

TEST_F(Detail, HasDefaultsForWhatItLacks) {
    const KestContentInfo record = loadTip("");
    EXPECT_EQ(record.menuTitle, "No Title");
    EXPECT_EQ(record.textContents, "No Contents");
    EXPECT_EQ(record.titleId, "");
    EXPECT_EQ(record.imagePath, "");
    EXPECT_EQ(record.textdomain, "");
    EXPECT_EQ(record.appName, "");
    EXPECT_EQ(record.launchAppid, "");
    EXPECT_EQ(record.launchParamKey, "");
    EXPECT_EQ(record.launchParamValue, "");
    EXPECT_EQ(record.iconPath, device()->packages().find(kest)->icon);
}

TEST_F(Detail, TakesAnEmptyElementForAnEmptyText) {
    const KestContentInfo record = loadTip("<title/><contents/><image/>");
    EXPECT_EQ(record.menuTitle, "");
    EXPECT_EQ(record.textContents, "");
    EXPECT_EQ(record.imagePath, resources().string() + "/");
}

TEST_F(Detail, MayLackItems) {
    const KestContentInfo record = loadFile("<tip><other/></tip>");
    EXPECT_EQ(record.menuTitle, "No Title");
    EXPECT_EQ(record.textContents, "No Contents");
    EXPECT_EQ(record.iconPath, device()->packages().find(kest)->icon);
    EXPECT_EQ(preference("contents_tip.xml_menuTitle"), "No Title");
    EXPECT_EQ(preference("contents_tip.xml_textContents"), "No Contents");
    EXPECT_THAT(errors(), IsEmpty());
    EXPECT_THAT(log(), testing::Contains(hit("__saveToPreference")));
}

TEST_F(Detail, MayHaveNothingButATextInItsRoot) {
    EXPECT_EQ(loadFile("<tip>text</tip>").menuTitle, "No Title");
    EXPECT_EQ(preference("contents_tip.xml_menuTitle"), "No Title");
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(Detail, ReadsTheFirstItemsOnly) {
    const KestContentInfo record =
        loadFile("<tip><other/><items><item><title>First</title></item></items>"
                 "<items><item><title>Second</title><appname>Name</appname></item></items></tip>");
    EXPECT_EQ(record.menuTitle, "First");
    EXPECT_EQ(record.appName, "");
}

TEST_F(Detail, ReadsNothingThatLiesDeeper) {
    const KestContentInfo record =
        loadFile("<tip><old><items><item><title>Old</title></item></items></old><items><item><appname>Name</appname>"
                 "<group><title>Grouped</title></group></item><group><item><title>Grouped</title></item></group>"
                 "</items></tip>");
    EXPECT_EQ(record.menuTitle, "No Title");
    EXPECT_EQ(record.appName, "Name");
}

TEST_F(Detail, ReadsEveryItemIntoTheSameRecord) {
    const KestContentInfo record =
        loadFile("<tip><items>text<item><title>First</title><appname>Name</appname></item><other/>"
                 "<item><title>Second</title></item></items></tip>");
    EXPECT_EQ(record.menuTitle, "Second");
    EXPECT_EQ(record.appName, "Name");
}

TEST_F(Detail, TakesOfEveryElementTheLastOfAllItems) {
    const auto item = [](const std::string& number) {
        return "<item><textdomain>tips" + number + "</textdomain><title id=\"IDS_OWN" + number +
               "\">x</title><appname>Name " + number + "</appname><image>" + number +
               ".png</image><launchappid>com.example.app" + number + "</launchappid><launchparamkey>key " + number +
               "</launchparamkey><launchparamvalue>value " + number + "</launchparamvalue></item>";
    };
    writeStrings({{"en", "IDS_OWN1", "First"}, {"en", "IDS_OWN2", "Second"}});
    const KestContentInfo record = loadFile("<tip><items>" + item("1") + item("2") + "</items></tip>");
    EXPECT_EQ(record.textdomain, "tips2");
    EXPECT_EQ(record.menuTitle, "Second");
    EXPECT_EQ(record.titleId, "IDS_OWN2");
    EXPECT_EQ(record.appName, "Name 2");
    EXPECT_EQ(record.imagePath, (resources() / "2.png").string());
    EXPECT_EQ(record.launchAppid, "com.example.app2");
    EXPECT_EQ(record.launchParamKey, "key 2");
    EXPECT_EQ(record.launchParamValue, "value 2");
}

TEST_F(Detail, IgnoresUnknownElements) {
    EXPECT_EQ(loadTip("text<!-- comment --><colour>red</colour><title>Title</title>").menuTitle, "Title");
}

TEST_F(Detail, DropsMarkupThatStandsOpenInAText) {
    EXPECT_EQ(loadTip("<title>A <b>bold</b> word</title>").menuTitle, "A bold word");
    EXPECT_EQ(loadTip("<contents>See <a href=\"x\">this</a></contents>").textContents, "See this");
    EXPECT_EQ(loadTip("<contents>See &lt;a href=x&gt;this&lt;/a&gt;</contents>").textContents,
              "See <a href=x>this</a>");
}

TEST_F(Detail, FindsPicturesBelowTheResourcesOfItsApplication) {
    addApplication("com.example.clock");
    writeMenus({{tipPath, "com.example.clock"}});
    writeDetail("<image>images/a.png</image>", tipPath, "com.example.clock");
    EXPECT_EQ(load().at(0).imagePath, (resources("com.example.clock") / "images/a.png").string());
}

TEST_F(Detail, OfAnApplicationThatIsNotInstalledLiesInTheFixedFolder) {
    writeMenus({{"contents/fallback.xml", "com.example.gone"}});
    const KestContentInfo record = load().at(0);
    const std::string fixed = KEST_APP_ROOT "/shared/res/";
    EXPECT_EQ(record.menuTitle, "From the fixed folder");
    EXPECT_EQ(record.imagePath, fixed + "images/a.png");
    EXPECT_EQ(record.textContents, "See <a href=file:/" + fixed + "images/b.png>this</a>");
}

TEST_F(Detail, OfAnApplicationThatIsNotInstalledDropsTheMenuWhenTheFixedFolderLacksIt) {
    writeMenus({{"contents/nowhere.xml", "com.example.gone"}});
    EXPECT_THAT(load(), IsEmpty());
    EXPECT_THAT(warnings(), ElementsAre(warning("__loadMainMenu", "__loadMainMenu failed : com.example.gone")));
}

TEST_F(Detail, MustBeXml) {
    const KestContentInfo record = loadFile("");
    EXPECT_EQ(record.menuTitle, "");
    EXPECT_EQ(record.iconPath, "");
    EXPECT_THAT(errors(), ElementsAre(error("__loadDetailMenu", "Failed to xmlReadFile")));
    EXPECT_THAT(log(), testing::Contains(info("loadContentsList", "__loadDetailMenu failed : " + kest)));
    EXPECT_TRUE(result());
}

TEST_F(Detail, MustHaveARoot) {
    const KestContentInfo record = loadFile("no element");
    EXPECT_EQ(record.menuTitle, "");
    EXPECT_THAT(errors(), ElementsAre(error("__loadDetailMenu", "Empty document")));
    EXPECT_THAT(log(), testing::Contains(info("loadContentsList", "__loadDetailMenu failed : " + kest)));
}

TEST_F(Detail, MustHaveARootWithChildren) {
    const KestContentInfo record = loadFile("<tip></tip>");
    EXPECT_EQ(record.menuTitle, "");
    EXPECT_THAT(errors(), ElementsAre(error("__loadDetailMenu", "Empty document")));
    EXPECT_THAT(log(), testing::Contains(info("loadContentsList", "__loadDetailMenu failed : " + kest)));
}

TEST_F(Detail, IsReadAsFarAsItCanBe) {
    const KestContentInfo record = loadFile("<tip><items><item><title>Title</title><contents>half of the te");
    EXPECT_EQ(record.menuTitle, "Title");
    EXPECT_EQ(record.textContents, "half of the te");
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(Detail, KeepsWhatFollowsATranslatedTitleOfTheSameItem) {
    // A later title without an id changes the title, not the id that was found before.
    const KestContentInfo record = loadTip("<title id=\"IDS_OWN\">x</title><title>Plain</title>");
    EXPECT_EQ(record.menuTitle, "Plain");
    EXPECT_EQ(record.titleId, "IDS_OWN");
}
