#include "KestCommon.h"
#include "KestPaths.h"

#include "kest/KestDevice.h"
#include "kest/Texts.h"

#include <gmock/gmock.h>

#include <libintl.h>

using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

class Text : public testing::Test, protected KestDevice {
protected:
    Text() { kest_texts::start("en_US.UTF-8"); }

    std::vector<kest_log::Line> log() const { return kest_log::all(device()); }
    static kest_log::Line error(const std::string& function, const std::string& message) {
        return kest_log::error("KestCommon.cpp", function, message);
    }
};

TEST_F(Text, OfTheApplicationsOwnIsFoundThere) {
    EXPECT_EQ(KestCommon::findProperDomain("IDS_OWN"), "kest");
    EXPECT_EQ(KestCommon::translateString("IDS_OWN"), "Own text");
    EXPECT_THAT(log(), IsEmpty());
}

TEST_F(Text, OfTheApplicationsOwnIsFoundAfterATipThatLeftItsDomainInTheSystemsFolder) {
    bindtextdomain("kest", "/usr/share/locale");
    EXPECT_EQ(KestCommon::translateString("IDS_OWN"), "Own text");
}

TEST_F(Text, OfNobodyElsesIsLookedForInContacts) {
    EXPECT_EQ(KestCommon::findProperDomain("IDS_CONTACTS"), "contacts");
    EXPECT_EQ(KestCommon::translateString("IDS_CONTACTS"), "Contacts");
}

TEST_F(Text, ThatContactsDoNotHaveEitherIsItsId) {
    EXPECT_EQ(KestCommon::findProperDomain("IDS_NOWHERE"), "contacts");
    EXPECT_EQ(KestCommon::translateString("IDS_NOWHERE"), "IDS_NOWHERE");
    EXPECT_THAT(log(), IsEmpty());
}

TEST_F(Text, OfTheApplicationsOwnThatIsItsIdIsLookedForInContacts) {
    EXPECT_EQ(KestCommon::findProperDomain("IDS_SELF"), "contacts");
    EXPECT_EQ(KestCommon::translateString("IDS_SELF"), "Itself, from the contacts");
}

TEST_F(Text, OfTheSystemIsNotLookedFor) {
    EXPECT_EQ(KestCommon::findProperDomain("IDS_SYSTEM"), "contacts");
    EXPECT_EQ(KestCommon::translateString("IDS_SYSTEM"), "IDS_SYSTEM");
}

TEST_F(Text, FollowsTheLanguage) {
    kest_texts::useLanguage("ko_KR.UTF-8");
    EXPECT_EQ(KestCommon::translateString("IDS_OWN"), "자체 텍스트");
    EXPECT_EQ(KestCommon::translateString("IDS_CONTACTS"), "연락처");
}

TEST_F(Text, OfAnEmptyIdHasNoDomain) {
    EXPECT_EQ(KestCommon::findProperDomain(""), "");
    EXPECT_THAT(log(), ElementsAre(error("findProperDomain", "idString empty")));
    EXPECT_THAT(kest_texts::bindings(), IsEmpty());
}

TEST_F(Text, OfAnEmptyIdIsEmpty) {
    EXPECT_EQ(KestCommon::translateString(""), "");
    EXPECT_THAT(log(), ElementsAre(error("translateString", "idString empty")));
}

TEST_F(Text, BindsTheFoldersOfTheDomainsThatItLooksIn) {
    KestCommon::findProperDomain("IDS_OWN");
    EXPECT_THAT(kest_texts::bindings(), ElementsAre(Pair("kest", kest_paths::locale)));
    kest_texts::start("en_US.UTF-8");
    KestCommon::findProperDomain("IDS_NOWHERE");
    EXPECT_THAT(kest_texts::bindings(),
                ElementsAre(Pair("kest", kest_paths::locale), Pair("contacts", "/usr/share/locale")));
}
