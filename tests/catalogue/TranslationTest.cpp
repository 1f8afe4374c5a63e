#include "CatalogueTest.h"

#include "KestPaths.h"

#include <libintl.h>

using namespace manager_log;
using kest_files::contents;
using kest_files::textTag;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

class Translation : public CatalogueTest {
protected:
    /// The title by that id in a tip of the domain "tips".
    std::string titleOf(const std::string& id) {
        return loadTip("<textdomain>tips</textdomain><title id=\"" + id + "\">untranslated</title>").menuTitle;
    }
    /// The translation of that id in the contents of such a tip.
    std::string textOf(const std::string& id) {
        return loadTip("<textdomain>tips</textdomain>" + contents(textTag(id))).textContents;
    }
};

TEST_F(Translation, OfATitleReplacesItsTextAndKeepsItsId) {
    const KestContentInfo record = loadTip("<title id=\"IDS_OWN\">untranslated</title>");
    EXPECT_EQ(record.menuTitle, "Own text");
    EXPECT_EQ(record.titleId, "IDS_OWN");
}

TEST_F(Translation, OfATitleAndANameIsTakenAsItStands) {
    const std::string value = "A & B\nnext line\\nno line";
    writeStrings({{"en", "IDS_MINE", value}});
    const KestContentInfo record = loadTip("<title id=\"IDS_MINE\">x</title><appname id=\"IDS_MINE\">x</appname>");
    EXPECT_EQ(record.menuTitle, value);
    EXPECT_EQ(record.appName, value);
}

TEST_F(Translation, OfATitleThatNothingKnowsIsItsText) {
    const KestContentInfo record = loadTip("<title id=\"IDS_NOWHERE\">untranslated</title>");
    EXPECT_EQ(record.menuTitle, "untranslated");
    EXPECT_EQ(record.titleId, "");
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(Translation, OfAnEmptyIdIsTheText) {
    const KestContentInfo record = loadTip("<title id=\"\">untranslated</title><appname id=\"\">Name</appname>");
    EXPECT_EQ(record.menuTitle, "untranslated");
    EXPECT_EQ(record.titleId, "");
    EXPECT_EQ(record.appName, "Name");
}

TEST_F(Translation, OfTheApplicationsNameFollowsTheSameRule) {
    EXPECT_EQ(loadTip("<appname id=\"IDS_OWN\">untranslated</appname>").appName, "Own text");
    EXPECT_EQ(loadTip("<appname id=\"IDS_NOWHERE\">untranslated</appname>").appName, "untranslated");
    EXPECT_EQ(loadTip("<appname>plain</appname>").appName, "plain");
}

TEST_F(Translation, OfTheApplicationsNameComesFromTheTipsDomainToo) {
    EXPECT_EQ(loadTip("<textdomain>tips</textdomain><appname id=\"IDS_TIPS\">untranslated</appname>").appName,
              "Text of the tips");
}

TEST_F(Translation, OfTheApplicationsNameKeepsNoId) {
    EXPECT_EQ(loadTip("<appname id=\"IDS_OWN\">untranslated</appname>").titleId, "");
}

TEST_F(Translation, ComesFromTheApplicationFirst) {
    writeStrings({{"en_US", "IDS_EVERYWHERE", "everywhere, from the file"}});
    EXPECT_EQ(titleOf("IDS_EVERYWHERE"), "everywhere, from the application");
    EXPECT_EQ(textOf("IDS_EVERYWHERE"), "everywhere, from the application");
}

TEST_F(Translation, ComesFromTheTipsDomainBeforeTheSystems) {
    EXPECT_EQ(titleOf("IDS_TIPS_AND_SYSTEM"), "both, from the tips");
    EXPECT_EQ(textOf("IDS_TIPS_AND_SYSTEM"), "both, from the tips");
}

TEST_F(Translation, ByTheApplicationThatIsTheIdItselfIsNone) {
    EXPECT_EQ(titleOf("IDS_SELF"), "Itself, from the tips");
    EXPECT_EQ(textOf("IDS_SELF"), "Itself, from the tips");
}

TEST_F(Translation, ComesFromTheSystemBeforeTheStringFile) {
    writeStrings({{"en_US", "IDS_SYSTEM_AND_FILE", "both, from the file"}});
    EXPECT_EQ(titleOf("IDS_SYSTEM_AND_FILE"), "both, from the system");
    EXPECT_EQ(textOf("IDS_SYSTEM_AND_FILE"), "both, from the system");
}

TEST_F(Translation, ComesFromTheStringFileLast) {
    writeStrings({{"en_US", "IDS_FILE", "from the file"}});
    EXPECT_EQ(titleOf("IDS_FILE"), "from the file");
    EXPECT_EQ(textOf("IDS_FILE"), "from the file");
}

TEST_F(Translation, FollowsTheDisplayLanguage) {
    EXPECT_EQ(titleOf("IDS_TIPS"), "Text of the tips");
    setLanguage("ko_KR.UTF-8");
    EXPECT_EQ(titleOf("IDS_TIPS"), "팁 텍스트");
    EXPECT_EQ(titleOf("IDS_SYSTEM"), "시스템 텍스트");
    EXPECT_EQ(titleOf("IDS_OWN"), "자체 텍스트");
}

TEST_F(Translation, NeedsTheDomainBeforeTheTitle) {
    EXPECT_EQ(loadTip("<title id=\"IDS_TIPS\">untranslated</title><textdomain>tips</textdomain>").menuTitle,
              "untranslated");
    EXPECT_EQ(loadTip("<textdomain>tips</textdomain><title id=\"IDS_TIPS\">untranslated</title>").menuTitle,
              "Text of the tips");
}

TEST_F(Translation, BindsTheTipsDomainToTheSystemsFolderLast) {
    titleOf("IDS_TIPS");
    EXPECT_THAT(kest_texts::bindings(),
                ElementsAre(Pair("tips", kest_paths::locale), Pair("tips", "/usr/share/locale")));
}

TEST_F(Translation, LeavesTheTipsDomainBoundToTheApplicationsFolderWhenThatKnowsTheText) {
    titleOf("IDS_OWN");
    EXPECT_THAT(kest_texts::bindings(), ElementsAre(Pair("tips", kest_paths::locale)));
}

TEST_F(Translation, OfTheTipsDomainIsOutOfReachAfterATextOfTheApplications) {
    // Whether a text is there is asked where the domain was bound last.
    const KestContentInfo record = loadTip("<textdomain>tips</textdomain><title id=\"IDS_OWN\">x</title>"
                                           "<appname id=\"IDS_TIPS\">untranslated</appname>");
    EXPECT_EQ(record.menuTitle, "Own text");
    EXPECT_EQ(record.appName, "untranslated");
}

TEST_F(Translation, InTheApplicationsDomainWorksForATipOfThatDomainToo) {
    const KestContentInfo record = loadTip("<textdomain>kest</textdomain><title id=\"IDS_OWN\">untranslated</title>");
    EXPECT_EQ(record.menuTitle, "Own text");
}

TEST_F(Translation, WithoutADomainComesFromTheApplicationAndTheSystem) {
    EXPECT_EQ(loadTip("<title id=\"IDS_OWN\">x</title>").menuTitle, "Own text");
    EXPECT_EQ(loadTip("<title id=\"IDS_SYSTEM\">x</title>").menuTitle, "System text");
    EXPECT_EQ(loadTip("<title id=\"IDS_TIPS\">x</title>").menuTitle, "x");
}
