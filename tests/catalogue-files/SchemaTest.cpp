#include "Schema.h"

#include <gmock/gmock.h>

namespace catalogue {
namespace {

using testing::ElementsAreArray;
using testing::IsEmpty;

const std::filesystem::path schemas = std::filesystem::path(PROJECT_FOLDER) / "docs/schemas";

const std::string goodMenu = R"(<kest>
<menus>
<menu>
<path>contents/a.xml</path>
<appid>com.ravella.clock</appid>
<state>Global,India</state>
</menu>
</menus>
</kest>)";

const std::string goodDetail = R"(<detail>
<items>
<item>
<textdomain>com.ravella.clock</textdomain>
<title id="IDS_A">Title</title>
<appname id="IDS_B">Clock</appname>
<image>contents/images/a_01.png</image>
<launchappid>com.ravella.settings</launchappid>
<launchparamkey>page</launchparamkey>
<launchparamvalue>faces</launchparamvalue>
<contents><![CDATA[<text id="IDS_C"></text> SIGN]]></contents>
<attach id="SIGN"><![CDATA[<item href=file:contents/a.png></item>]]></attach>
</item>
</items>
</detail>)";

const std::string goodStrings = R"(<strings>
<items>
<item>
<region>en_US</region>
<stringid>IDS_A</stringid>
<value>One line,
and another</value>
</item>
<item>
<region>ko</region>
<stringid>IDS_A</stringid>
<value>A</value>
</item>
</items>
</strings>)";

/// One change to a good file and what the schema says of it.
struct Mistake {
    std::string name;
    std::string from;
    std::string to;
    std::vector<std::string> problems;
};

void PrintTo(const Mistake& mistake, std::ostream* stream) {
    *stream << mistake.name;
}

/// What libxml2 says of an element whose text is not what the schema wants.
std::vector<std::string> badText(const std::string& file, int line, const std::string& element) {
    const std::string place = file + ":" + std::to_string(line) + ": ";
    return {place + "Error validating datatype string", place + "Element " + element + " failed to validate content"};
}

std::vector<std::string> hasElements(const std::string& file, int line, const std::string& element) {
    const std::string place = file + ":" + std::to_string(line) + ": ";
    return {place + "Datatype element " + element + " has child elements",
            place + "Element " + element + " failed to validate content"};
}

std::vector<std::string> badState(int line) {
    const std::string place = "menu.xml:" + std::to_string(line) + ": ";
    return {place + "Error validating value", place + "Error validating datatype string",
            place + "Element state failed to validate content"};
}

void expectRefusal(const std::string& schema, const std::string& file, std::string text, const Mistake& mistake) {
    const std::size_t at = text.find(mistake.from);
    ASSERT_NE(std::string::npos, at);
    text.replace(at, mistake.from.size(), mistake.to);
    EXPECT_THAT(schemaProblems(schemas / schema, text, file), ElementsAreArray(mistake.problems));
}

std::string nameOf(const testing::TestParamInfo<Mistake>& info) {
    return info.param.name;
}

TEST(Schemas, AcceptGoodFiles) {
    EXPECT_THAT(schemaProblems(schemas / "kest_menu.rng", goodMenu, "menu.xml"), IsEmpty());
    EXPECT_THAT(schemaProblems(schemas / "kest_detail.rng", goodDetail, "a.xml"), IsEmpty());
    EXPECT_THAT(schemaProblems(schemas / "kest_strings.rng", goodStrings, "a-string.xml"), IsEmpty());
}

TEST(Schemas, AcceptAFileWithoutWhatIsOptional) {
    EXPECT_THAT(schemaProblems(schemas / "kest_menu.rng", "<kest><menus/></kest>", "menu.xml"), IsEmpty());
    const std::string bare = "<detail><items><item><textdomain>a</textdomain><title id=\"IDS_A\">A</title>"
                             "<appname id=\"IDS_B\">B</appname><contents>c &lt;br/&gt;</contents></item></items>"
                             "</detail>";
    EXPECT_THAT(schemaProblems(schemas / "kest_detail.rng", bare, "a.xml"), IsEmpty());
}

class MenuMistake : public testing::TestWithParam<Mistake> {};
TEST_P(MenuMistake, IsRefused) {
    expectRefusal("kest_menu.rng", "menu.xml", goodMenu, GetParam());
}

const Mistake menuMistakes[] = {
    {"PathLeavesTheFolder", "contents/a.xml", "contents/../a.xml", badText("menu.xml", 4, "path")},
    {"PathIsAbsolute", "contents/a.xml", "/contents/a.xml", badText("menu.xml", 4, "path")},
    {"PathIsElsewhere", "contents/a.xml", "a.xml", badText("menu.xml", 4, "path")},
    {"PathHasXmlTwice", "contents/a.xml", "contents/a.xml.xml", badText("menu.xml", 4, "path")},
    {"PathHasABlank", "contents/a.xml", "contents/a b.xml", badText("menu.xml", 4, "path")},
    {"PathIsEmpty", "contents/a.xml", "", badText("menu.xml", 4, "path")},
    {"AppidIsEmpty", "com.ravella.clock", "", badText("menu.xml", 5, "appid")},
    {"AppidHasXmlInIt", "com.ravella.clock", "com.xmlviewer", badText("menu.xml", 5, "appid")},
    {"AppidIsNoBusName", "com.ravella.clock", "clock", badText("menu.xml", 5, "appid")},
    {"StateIsEmpty", "Global,India", "", badState(6)},
    {"StateHasAnUnknownRegion", "Global,India", "Global,Indian", badState(6)},
    {"StateHasABlank", "Global,India", "Global, India", badState(6)},
    {"StateMixesNokWithRegions", "Global,India", "NOK,India", badState(6)},
    {"StateIsInLowerCase", "Global,India", "global", badState(6)},
    {"StateIsMissing", "<state>Global,India</state>", "", {"menu.xml:3: Expecting an element , got nothing"}},
    {"UnknownElement", "<state>", "<image/><state>", {"menu.xml:6: Did not expect element image there"}},
    {"NotWellFormed", "</menu>", "", {"menu.xml:8: Opening and ending tag mismatch: menu line 3 and menus"}},
};
INSTANTIATE_TEST_SUITE_P(Schemas, MenuMistake, testing::ValuesIn(menuMistakes), nameOf);

class DetailMistake : public testing::TestWithParam<Mistake> {};
TEST_P(DetailMistake, IsRefused) {
    expectRefusal("kest_detail.rng", "a.xml", goodDetail, GetParam());
}

const Mistake detailMistakes[] = {
    {"TextdomainIsTheApplications", ">com.ravella.clock<", ">kest<", badText("a.xml", 4, "textdomain")},
    {"TextdomainIsTheDevices", ">com.ravella.clock<", ">sys_string<", badText("a.xml", 4, "textdomain")},
    {"TextdomainIsTheContacts", ">com.ravella.clock<", ">contacts<", badText("a.xml", 4, "textdomain")},
    {"TextdomainIsEmpty", ">com.ravella.clock<", "><", badText("a.xml", 4, "textdomain")},
    {"TextdomainComesAfterTitle",
     "<textdomain>com.ravella.clock</textdomain>\n<title id=\"IDS_A\">Title</title>",
     "<title id=\"IDS_A\">Title</title>\n<textdomain>com.ravella.clock</textdomain>",
     {"a.xml:4: Did not expect element title there"}},
    {"TitleHasNoId", "<title id=\"IDS_A\">", "<title>", {"a.xml:5: Element title failed to validate content"}},
    {"TitlesIdIsEmpty", "id=\"IDS_A\"", "id=\"\"", {"a.xml:5: Element title failed to validate content"}},
    {"TitlesIdHasNoPrefix", "id=\"IDS_A\"", "id=\"WIFI\"", {"a.xml:5: Element title failed to validate content"}},
    {"TitleIsEmpty", ">Title<", "><", badText("a.xml", 5, "title")},
    {"TitleHasAnAmpersand", ">Title<", ">Hands &amp; faces<", badText("a.xml", 5, "title")},
    {"TitleHasMarkup", ">Title<", ">&lt;b&gt;Title&lt;/b&gt;<", badText("a.xml", 5, "title")},
    {"TitleBeginsWithABlank", ">Title<", "> Title<", badText("a.xml", 5, "title")},
    {"AppnameIsMissing", "<appname id=\"IDS_B\">Clock</appname>", "", {"a.xml:7: Did not expect element image there"}},
    {"ImageIsEmpty", "contents/images/a_01.png", "", badText("a.xml", 7, "image")},
    {"ImageLeavesTheFolder", "contents/images/a_01.png", "contents/../../a_01.png", badText("a.xml", 7, "image")},
    {"ImageIsNoPicture", "contents/images/a_01.png", "contents/images/a_01.svg", badText("a.xml", 7, "image")},
    {"ImageHasALongEnding", "contents/images/a_01.png", "contents/images/a_01.jpeg", badText("a.xml", 7, "image")},
    {"KeyHasNoValue",
     "<launchparamvalue>faces</launchparamvalue>",
     "",
     {"a.xml:11: Did not expect element contents there"}},
    {"ValueHasNoKey",
     "<launchparamkey>page</launchparamkey>",
     "",
     {"a.xml:10: Did not expect element launchparamvalue there"}},
    {"KeyIsEmpty", ">page<", "><", badText("a.xml", 9, "launchparamkey")},
    {"LaunchappidIsEmpty", ">com.ravella.settings<", "><", badText("a.xml", 8, "launchappid")},
    {"ContentsAreElements", "<![CDATA[<text id=\"IDS_C\"></text> SIGN]]>", "<text id=\"IDS_C\"></text> SIGN",
     hasElements("a.xml", 11, "contents")},
    {"ContentsAreEmpty", "<![CDATA[<text id=\"IDS_C\"></text> SIGN]]>", "", badText("a.xml", 11, "contents")},
    {"ContentsAreIndented", "<contents><![CDATA[", "<contents>\n<![CDATA[", badText("a.xml", 11, "contents")},
    {"AttachHasNoId", "<attach id=\"SIGN\">", "<attach>", {"a.xml:12: Element attach failed to validate attributes"}},
    {"AttachsIdIsEmpty", "id=\"SIGN\"", "id=\"\"", {"a.xml:12: Element attach failed to validate attributes"}},
    {"AttachIsElements", "<![CDATA[<item href=file:contents/a.png></item>]]>", "<item href=\"a\"/>",
     hasElements("a.xml", 12, "attach")},
    {"AttachComesBeforeContents",
     "<contents>",
     "<attach id=\"B\">b</attach>\n<contents>",
     {"a.xml:11: Did not expect element attach there"}},
    {"TwoItems",
     "<item>",
     "<item/>\n<item>",
     {"a.xml:3: Expecting an element , got nothing", "a.xml:4: Did not expect element item there"}},
    {"TwoItemsElements", "</items>", "</items><items/>", {"a.xml:14: Did not expect element items there"}},
};
INSTANTIATE_TEST_SUITE_P(Schemas, DetailMistake, testing::ValuesIn(detailMistakes), nameOf);

TEST(Schemas, RefuseAStringFileWithoutStrings) {
    EXPECT_THAT(schemaProblems(schemas / "kest_strings.rng", "<strings>\n<items/>\n</strings>", "a-string.xml"),
                testing::ElementsAre("a-string.xml:2: Expecting an element , got nothing"));
}

class StringsMistake : public testing::TestWithParam<Mistake> {};
TEST_P(StringsMistake, IsRefused) {
    expectRefusal("kest_strings.rng", "a-string.xml", goodStrings, GetParam());
}

const Mistake stringsMistakes[] = {
    {"RegionIsEmpty", ">en_US<", "><", badText("a-string.xml", 4, "region")},
    {"RegionHasACodeset", ">en_US<", ">en_US.UTF-8<", badText("a-string.xml", 4, "region")},
    {"RegionIsInUpperCase", ">en_US<", ">EN<", badText("a-string.xml", 4, "region")},
    {"RegionIsAWord", ">en_US<", ">English<", badText("a-string.xml", 4, "region")},
    {"IdIsEmpty", ">IDS_A<", "><", badText("a-string.xml", 5, "stringid")},
    {"IdHasNoPrefix", ">IDS_A<", ">A<", badText("a-string.xml", 5, "stringid")},
    {"IdIsInLowerCase", ">IDS_A<", ">IDS_a<", badText("a-string.xml", 5, "stringid")},
    {"ValueIsEmpty", "One line,\nand another", "", badText("a-string.xml", 6, "value")},
    {"ValueEndsWithANewline", "and another", "and another\n", badText("a-string.xml", 6, "value")},
    {"ValueIsElements", "One line,", "<b>One</b> line,", hasElements("a-string.xml", 6, "value")},
};
INSTANTIATE_TEST_SUITE_P(Schemas, StringsMistake, testing::ValuesIn(stringsMistakes), nameOf);

}  // namespace
}  // namespace catalogue
