#include "HostileXmlTest.h"

using namespace manager_log;
using testing::IsEmpty;

TEST_F(HostileXml, EntityOfTheFilesOwnIsPutIn) {
    EXPECT_EQ(loadDetail(file(entity("name", "Kest"), "<title>About &name; &amp; &#65;</title>")).menuTitle,
              "About Kest & A");
}

TEST_F(HostileXml, EntityOfTheFilesOwnIsPutIntoAnAttribute) {
    EXPECT_EQ(loadDetail(file(entity("id", "OWN"), "<title id=\"IDS_&id;\">x</title>")).menuTitle, "Own text");
}

TEST_F(HostileXml, EntityThatNobodyDeclaredIsLeftOut) {
    EXPECT_EQ(loadDetail("<tip><items><item><title>a&nothing;b</title></item></items></tip>").menuTitle, "ab");
}

TEST_F(HostileXml, BillionLaughsBeforeTheItemsLeaveNoTitle) {
    const std::string text = std::string(kest_files::xmlHead) + "<!DOCTYPE tip [\n" + billionLaughs() +
                             "]>\n<tip>\n&a9;<items><item><title>Title</title></item></items></tip>";
    const KestContentInfo record = loadDetail(text);
    EXPECT_EQ(record.menuTitle, "No Title");
    EXPECT_EQ(record.textContents, "No Contents");
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(HostileXml, BillionLaughsInATitleLeaveItEmpty) {
    EXPECT_LE(loadDetail(file(billionLaughs(), "<title>&a9;</title>")).menuTitle.size(), 16U << 20);
}

TEST_F(HostileXml, BillionLaughsInContentsLeaveThemBounded) {
    EXPECT_LE(loadDetail(file(billionLaughs(), "<contents>&a9;</contents>")).textContents.size(), 16U << 20);
}

TEST_F(HostileXml, BillionLaughsInAnAttributeLeaveTheText) {
    EXPECT_EQ(loadDetail(file(billionLaughs(), "<title id=\"&a9;\">Title</title>")).menuTitle, "Title");
    EXPECT_EQ(loadDetail(file(billionLaughs(), "<contents>text</contents><attach id=\"&a9;\">x</attach>")).textContents,
              "xtext");
}

TEST_F(HostileXml, BillionLaughsInTheMainMenuLeaveItBounded) {
    support::writeFile(mainMenuFile(), std::string(kest_files::xmlHead) + "<!DOCTYPE tips [" + billionLaughs() +
                                           "]><tips><menus><menu><path>&a9;</path><appid>&a9;</appid>"
                                           "<state>Global &a9;</state></menu></menus></tips>");
    EXPECT_LE(load().size(), 1U);
}

TEST_F(HostileXml, BillionLaughsInTheStringsLeaveTheTip) {
    writeStringFile(file(billionLaughs(), "<region>en</region><stringid>IDS_MINE</stringid><value>&a9;</value>"));
    EXPECT_LE(loadTip("<title id=\"IDS_MINE\">untranslated</title>").menuTitle.size(), 16U << 20);
}

TEST_F(HostileXml, ManyReferencesToALongEntityAreLeftOut) {
    EXPECT_EQ(loadDetail(file(longEntity(), "<title>a" + repeated("&long;", 1000) + "b</title>")).menuTitle, "ab");
    EXPECT_EQ(loadDetail(file(longEntity(), "<title id=\"" + repeated("&long;", 1000) + "\">Title</title>")).menuTitle,
              "Title");
}

TEST_F(HostileXml, ManyElementsOfALongEntityAreBoundedTogether) {
    std::string items;
    for (int i = 0; i < 400; ++i)
        items +=
            "<item><region>en</region><stringid>IDS_" + std::to_string(i) + "</stringid><value>&long;</value></item>";
    writeStringFile(std::string(kest_files::xmlHead) + "<!DOCTYPE strings [" + longEntity() + "]><strings><items>" +
                    items + "</items></strings>");
    EXPECT_EQ(loadTip("<title id=\"IDS_7\">untranslated</title>").menuTitle, "");
}

TEST_F(HostileXml, ManyAttachmentsOfALongEntityAreBoundedTogether) {
    EXPECT_EQ(loadDetail(
                  file(longEntity(), "<contents>text</contents>" + repeated("<attach id=\"t\">t&long;</attach>", 1000)))
                  .textContents,
              "text");
}

TEST_F(HostileXml, ManyEntitiesAreMeasuredOnce) {
    std::string declarations = entity("e0", "x");
    for (int i = 1; i < 10; ++i)
        declarations += entity("e" + std::to_string(i), "&e" + std::to_string(i - 1) + ";");
    EXPECT_EQ(loadDetail(file(declarations, repeated("<title>&e9;</title>", 2000))).menuTitle, "x");
}

TEST_F(HostileXml, IsNotParsedWithMuchBesideADocumentType) {
    expectNotParsed(file(entity("a", "b"), "<title>" + std::string(65536, 'x') + "</title>"));
}

TEST_F(HostileXml, IsNotParsedWithAttributesThatItDeclares) {
    // They come with every element, and each is compared with all the others.
    std::string declarations = "<!ATTLIST x";
    for (int i = 0; i < 3000; ++i)
        declarations += " a" + std::to_string(i) + " CDATA ''";
    expectNotParsed(file(declarations + ">", repeated("<x/>", 4000)));
}

TEST_F(HostileXml, IsNotParsedWithParameterEntities) {
    // They could hide such a declaration.
    expectNotParsed(file("<!ENTITY\n% p \"<!&#65;TTLIST x a CDATA ''>\">%p;", "<title>Title</title>"));
}

TEST_F(HostileXml, IsNotParsedWithEntitiesInNamespaces) {
    const std::string declarations = entity("e0", "x") + entity("e1", repeated("&e0;", 100)) +
                                     entity("e2", repeated("&e1;", 100)) + "<!--" + std::string(40000, 'x') + "-->";
    expectNotParsed("<!DOCTYPE tip [" + declarations + "]><tip xmlns='&e2;'>" + repeated("&e2;", 1000) + "</tip>");
}

TEST_F(HostileXml, EntityThatHoldsItselfEnds) {
    EXPECT_EQ(loadDetail(file(entity("a", "&a;"), "<title>x&a;y</title>")).appName, "");
    EXPECT_EQ(loadDetail(file(entity("a", "&b;") + entity("b", "&a;"), "<title>x&a;y</title>")).appName, "");
    EXPECT_EQ(loadDetail(file(entity("a", "&a;"), "<title id=\"&a;\">Title</title>")).appName, "");
}

TEST_F(HostileXml, EntityThatHoldsElementsIsReadAsTheirText) {
    EXPECT_EQ(loadDetail(file(entity("a", "<b>bold &amp;</b><c d='e'/> word"), "<title>&a;</title>")).menuTitle,
              "bold & word");
}

TEST_F(HostileXml, ExternalFilesAreNeverOpened) {
    makeFifo(resources() / "contents/pipe");
    support::writeFile(resources() / "contents/secret", "secret");
    for (const char* name : {"pipe", "secret", "/dev/zero", "http://127.0.0.1:9/x"}) {
        const std::string target = name;
        EXPECT_EQ(loadDetail(file("<!ENTITY x SYSTEM \"" + target + "\">", "<title>a&x;b</title>")).menuTitle, "ab");
        EXPECT_EQ(loadDetail(file("<!ENTITY % x SYSTEM \"" + target + "\"> %x;", "<title>ab</title>")).menuTitle, "");
        EXPECT_EQ(loadDetail("<!DOCTYPE tip SYSTEM \"" + target +
                             "\"><tip><items><item><title>ab</title></item></items></tip>")
                      .menuTitle,
                  "ab");
        EXPECT_EQ(
            loadDetail("<tip xmlns:xi=\"http://www.w3.org/2001/XInclude\"><items><item><title>a<xi:include href=\"" +
                       target + "\" parse=\"text\"/>b</title></item></items></tip>")
                .menuTitle,
            "ab");
    }
}

TEST_F(HostileXml, ManyElementsOfEntitiesAreLeftOut) {
    const std::string declarations = entity("a", repeated("<x/>", 5000)) + entity("b", repeated("&a;", 5000));
    EXPECT_EQ(loadDetail(file(declarations, "<title>a" + repeated("&b;", 60) + "c</title>")).menuTitle, "ac");
}

TEST_F(HostileXml, AnIdMayBeManyReferences) {
    writeStringFile("<strings><items><item><region>en</region><stringid>" + std::string(8000, 'a') +
                    "</stringid><value>Mine</value></item></items></strings>");
    EXPECT_EQ(loadDetail(file(entity("a", "aa"), "<title id='" + repeated("&a;", 4000) + "'>x</title>")).menuTitle,
              "Mine");
}

TEST_F(HostileXml, NamesFieldsByElementsOnly) {
    const KestContentInfo record = loadDetail(
        file(entity("title", "Entity"), "<title>Title</title>\n<?title Instruction?>\n&title;\n<?items x?>\n"));
    EXPECT_EQ(record.menuTitle, "Title");
}
