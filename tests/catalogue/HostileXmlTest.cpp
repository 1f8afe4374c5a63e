#include "HostileTest.h"

using namespace manager_log;
using testing::IsEmpty;

/// Entities: declared in a few bytes, they can stand for more than the machine has.
class HostileXml : public HostileTest {
protected:
    void SetUp() override { testing::internal::CaptureStderr(); }
    /// The parser has much to say of these files; none of it is for people.
    void TearDown() override { EXPECT_EQ(testing::internal::GetCapturedStderr(), ""); }

    static std::string file(const std::string& declarations, const std::string& item) {
        return std::string(kest_files::xmlHead) + "<!DOCTYPE tip [\n" + declarations + "]>\n<tip>\n<items>\n<item>\n" +
               item + "</item>\n</items>\n</tip>\n";
    }
    static std::string entity(const std::string& name, const std::string& value) {
        return "<!ENTITY " + name + " \"" + value + "\">\n";
    }
    /// "&a9;" stands for ten to the ninth words.
    static std::string billionLaughs() {
        std::string declarations = entity("a0", "lol");
        for (int i = 1; i < 10; ++i)
            declarations += entity("a" + std::to_string(i), repeated("&a" + std::to_string(i - 1) + ";", 10));
        return declarations;
    }
    /// The same without a document type.
    static std::string plain(const std::string& item) { return "<tip><items><item>" + item + "</item></items></tip>"; }
    /// Stands for a million letters.
    static std::string longEntity() {
        return entity("part", std::string(10000, 'a')) + entity("long", repeated("&part;", 100));
    }
    static std::string withAttributes(int count, const std::string& value) {
        std::string all;
        for (int i = 0; i < count; ++i)
            all += " a" + std::to_string(i) + value;
        return plain("<title" + all + ">Title</title>");
    }
    void expectNotParsed(const std::string& text) {
        EXPECT_EQ(loadDetail(text).menuTitle, "");
        EXPECT_THAT(errors(), testing::Contains(error("__loadDetailMenu", "Failed to xmlReadFile")));
    }
    KestContentInfo loadDetail(const std::string& text) {
        writeMenus({{}});
        support::writeFile(resources() / tipPath, text);
        const auto records = load();
        EXPECT_TRUE(result());
        return records.at(0);
    }
    void writeStringFile(const std::string& text) { support::writeFile(resources() / "contents/tip-string.xml", text); }
};

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

TEST_F(HostileXml, MayHaveHundredsOfAttributes) {
    EXPECT_EQ(loadDetail(withAttributes(256, "='x'")).menuTitle, "Title");
}

TEST_F(HostileXml, IsNotParsedWithMoreAttributesHoweverTheyAreWritten) {
    for (const char* value : {"='x'", "=\"x\"", "= 'x'", " =\n'x'", "='>'", "=\"'\""})
        expectNotParsed(withAttributes(257, value));
}

TEST_F(HostileXml, MayHaveThousandsOfQuotesInItsText) {
    const std::string text = repeated("say=\"x\" it's > ", 10000);
    EXPECT_EQ(loadDetail(plain("<title>" + text + "</title>")).menuTitle, text);
}

TEST_F(HostileXml, MayHaveThousandsOfEscapedTextTags) {
    const std::string tags = repeated("&lt;text id=\"IDS_OWN\"&gt;x&lt;/text&gt;", 5000);
    EXPECT_EQ(loadDetail(plain("<contents>" + tags + "</contents>")).textContents, repeated("Own text", 5000));
}

TEST_F(HostileXml, MayHaveHundredsOfQuotesInASectionOrAComment) {
    const std::string quotes = "x < y " + repeated("\"x\" xmlns ", 300);
    EXPECT_EQ(
        loadDetail(plain("<!-- " + quotes + "--><?note " + quotes + "?><title><![CDATA[" + quotes + "]]></title>"))
            .menuTitle,
        quotes);
}

TEST_F(HostileXml, MayNameAFewNamespaces) {
    EXPECT_EQ(loadDetail("<tip xmlns='a' xmlns:b='b'><items><item><title>Title</title></item></items></tip>").menuTitle,
              "Title");
}

TEST_F(HostileXml, CannotHideAttributesBehindWhatLooksLikeAComment) {
    const std::string tag = withAttributes(257, "='x'");
    expectNotParsed("<?x <!-- ?>" + tag + "<?y --> ?>");
    expectNotParsed("<!-- <![CDATA[ -->" + tag + "<!-- ]]> -->");
    expectNotParsed("<!-- <? -->" + tag + "<?y ?>");
    expectNotParsed(repeated("<!--", 100000) + tag);
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

TEST_F(HostileXml, IsNotParsedWithHundredsOfNamespaces) {
    // Every element with a prefix asks for it among all of them.
    std::string declarations;
    for (int i = 0; i < 257; ++i)
        declarations += "<x xmlns:n" + std::to_string(i) + "='n'>";
    expectNotParsed(plain(declarations + repeated("<z:a/>", 1000) + repeated("</x>", 257)));
}

TEST_F(HostileXml, IsNotParsedWithMillionsOfElements) {
    expectNotParsed(plain(repeated("<x/>", 3000001)));
}

TEST_F(HostileXml, MayHaveAMillionElements) {
    EXPECT_EQ(loadDetail("<tip>" + repeated("<x/>", 500000) + "<items>" + repeated("<x/>", 500000) + "<item>" +
                         repeated("<x/>", 500000) + "<title>Title</title></item></items></tip>")
                  .menuTitle,
              "Title");
}

TEST_F(HostileXml, NamesFieldsByElementsOnly) {
    const KestContentInfo record = loadDetail(
        file(entity("title", "Entity"), "<title>Title</title>\n<?title Instruction?>\n&title;\n<?items x?>\n"));
    EXPECT_EQ(record.menuTitle, "Title");
}
