#include "HostileXmlTest.h"

// Tags, attributes and namespaces that would take the parser longer than the square of their number.

TEST_F(HostileXml, MayHaveThousandsOfAttributes) {
    EXPECT_EQ(loadDetail(withAttributes(16000, "='x'")).menuTitle, "Title");
}

TEST_F(HostileXml, IsNotParsedWithMoreAttributesHoweverTheyAreWritten) {
    for (const char* value : {"='x'", "=\"x\"", "= 'x'", " =\n'x'", "='>'", "=\"'\"", "='\"'", "=\r\t '>'"})
        expectNotParsed(withAttributes(17000, value));
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
    const std::string tag = withAttributes(400000, "='x'");
    expectNotParsed("<?x <!-- ?>" + tag + "<?y --> ?>");
    expectNotParsed("<!-- <![CDATA[ -->" + tag + "<!-- ]]> -->");
    expectNotParsed("<!-- <? -->" + tag + "<?y ?>");
    expectNotParsed("<!--> <![CDATA[ -->" + tag + "]]>");
    expectNotParsed("<? " + tag + " ?>");
    expectNotParsed("<?>" + tag + "?>");
    for (const char* begin : {"<!-- \x01", "<?x \x01", "<![CDATA[ \x01"})
        expectNotParsed(plain(begin + tag + "--> ?> ]]>"));
    expectNotParsed(repeated("<!--", 100000) + tag);
    expectNotParsed("<tip a='<" + tag);
    expectNotParsed("<tip a='\">' b=<" + tag);
}

TEST_F(HostileXml, MayHaveManyAttributesInEveryTag) {
    const std::string tag = withAttributes(1000, "='x'");
    EXPECT_EQ(
        loadDetail("<tip><items><item>" + repeated(tag, 200) + "<title>Title</title></item></items></tip>").menuTitle,
        "Title");
    expectNotParsed("<tip><items><item>" + repeated(tag, 600) + "<title>Title</title></item></items></tip>");
}

TEST_F(HostileXml, MayHaveHundredsOfNamespaces) {
    EXPECT_EQ(loadDetail(withNamespaces(500, repeated("<z:a/>", 8000))).menuTitle, "Title");
}

TEST_F(HostileXml, IsNotParsedWithNamespacesInALongFile) {
    const std::string begin = "<tip xmlns:b='u'><items><item><title>Title</title></item></items>";
    const std::string end = "</tip>";
    const std::string rest(64 * 1024 - begin.size() - end.size(), ' ');
    EXPECT_EQ(loadDetail(begin + rest + end).menuTitle, "Title");
    expectNotParsed(begin + rest + " " + end);
}

TEST_F(HostileXml, MayRepeatAttributesOfLongNamespaces) {
    // Each message about one quotes the namespace.
    const std::string name = "'urn:" + std::string(20000, 'u') + "'";
    loadDetail("<tip xmlns:b=" + name + " xmlns:c=" + name + " b:x=''" + repeated(" c:x=''", 3000) + "><items/></tip>");
}

TEST_F(HostileXml, IsReadForAFewSecondsWhenItHasMillionsOfNames) {
    std::string names;
    for (int i = 0; names.size() < (15 << 20); ++i)
        names += "<n" + std::to_string(i) + "/>";
    EXPECT_EQ(
        loadDetail("<tip><items><item><title>Title</title>" + names + "<title>Behind</title></item></items></tip>")
            .menuTitle,
        "Title");
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

TEST_F(HostileXml, MayHaveErrorsThatQuoteItAllEachTime) {
    loadDetail("<tip><!--" + repeated("x -- ", 3000000) + "--></tip>");
    loadDetail("<tip>" + repeated("<!--", 4000000) + "</tip>");
    std::string attributes;
    for (int i = 0; i < 400; ++i)
        attributes += " p:a" + std::to_string(i) + "=''";
    loadDetail("<tip>" + repeated("<" + std::string(49000, 'n') + attributes + "/>", 300) + "</tip>");
}

TEST_F(HostileXml, MayHaveErrorsWithoutEndBehindALongValue) {
    const std::string begin = "<a x='" + std::string(3000000, 'y') + "'>";
    loadDetail(begin + repeated("]]>", 600000) + "</a>");
    loadDetail(begin + repeated("<p:b/>", 300000) + "</a>");
    loadDetail(begin + repeated("&nothing;", 300000) + "</a>");
    loadDetail(begin + repeated("</c>", 600000) + "</a>");
    loadDetail(begin + "<!--" + repeated("x -- ", 600000) + "--></a>");
}

TEST_F(HostileXml, IsNotParsedWithManyDashesBehindALongComment) {
    const std::string title = "<items><item><title>Title</title></item></items></tip>";
    expectNotParsed("<tip><!--" + std::string(9000000, 'x') + std::string(20000, '-') + "-->" + title);
    EXPECT_EQ(
        loadDetail("<tip><!--" + std::string(9000000, 'x') + " -- " + std::string(20, '-') + "-->" + title).menuTitle,
        "Title");
    expectNotParsed("<tip><!" + std::string(1000000, '-') + ">" + title);
    expectNotParsed("<tip><!--" + std::string(9000000, 'x') + repeated("x--->", 20000) + "-->" + title);
    EXPECT_EQ(loadDetail("<tip>" + repeated("<!-- a - b -->", 500000) + title).menuTitle, "Title");
    EXPECT_EQ(loadDetail("<tip>" + repeated("a text -- with dashes ", 400000) + title).menuTitle, "Title");
}

TEST_F(HostileXml, MayBeBrokenInThousandsOfPlaces) {
    const std::string text = repeated("Black & white, ", 20000);
    EXPECT_NE(
        loadDetail("<tip><items><item><title>" + text + "</title><appname>App</appname></item></items></tip>").appName,
        "");
}

TEST_F(HostileXml, MayNameCatalogsWithoutEnd) {
    EXPECT_EQ(loadDetail(repeated("<?oasis-xml-catalog catalog=\"x\"?>", 300000) +
                         "<tip><items><item><title>Title</title></item></items></tip>")
                  .menuTitle,
              "Title");
}

TEST_F(HostileXml, IsReadAsUtf8FarBehindADeclarationOfAnother) {
    const std::string padding = "<!--" + std::string(9000, 'x') + "-->";
    for (const char* begin :
         {"<?xml version='1.0' encoding='iso-8859-1'?>", "<?xml version='1.0' encoding='UTF-7'>",
          "<?xml\tencoding=\"utf-16\"?>", "<?xml version='1.0' encoding='utf-8'?>",
          "<?xml ?><?xml version='1.0' encoding='UTF-7'?>", "<?xml ?>\n<?xml version='1.0' encoding='UTF-7'?>"})
        EXPECT_EQ(
            loadDetail(begin + padding + "<tip><items><item><title>caf\u00e9 +ACIAIg-</title></item></items></tip>")
                .menuTitle,
            "caf\u00e9 +ACIAIg-")
            << begin;
}

TEST_F(HostileXml, MayBeNothingButADeclaration) {
    for (const char* text : {"<?xml version='1.0' encoding='UTF-7'", "<?xml ", "<?xml version='1.0'?>",
                             "<?xml version='1.0' encoding='utf-8'?>\n"}) {
        EXPECT_EQ(loadDetail(text).menuTitle, "");
        EXPECT_THAT(errors(), testing::Contains(manager_log::error("__loadDetailMenu", "Empty document")));
    }
}
