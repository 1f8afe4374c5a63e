#include "ui_extension.h"

#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sys/stat.h>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class Tables : public testing::Test {
protected:
    std::string file(const std::string& text) const {
        const auto path = device_.folder() / "table.xml";
        support::writeFile(path, text);
        return path;
    }

    support::TemporaryDevice device_;
};

TEST_F(Tables, AColourTableGivesEachClassALightAndADarkColour) {
    uxt_color_table* const table = uxt_theme_add_color_table(file(R"(<?xml version="1.0"?>
<!-- the list -->
<color_table>
  <color class="list/page" light="#FFFFFF" dark="#00000080"/>
  <color class="list &amp; more" light="#abcdef" dark="#ABCDEF"></color>
</color_table>
)")
                                                                 .c_str());
    EXPECT_NE(nullptr, table);
    EXPECT_THAT(device_.logMessages(), IsEmpty());
    uxt_theme_delete_color_table(table);
}

TEST_F(Tables, AFontTableGivesEachClassAFontAndASize) {
    uxt_font_table* const table = uxt_theme_add_font_table(file(R"(<font_table>
  <font class="list/title" font="Noto Sans:style=Bold" size="44"/>
  <font class="list/text" font="Noto Sans" size="120%"/>
</font_table>)")
                                                               .c_str());
    EXPECT_NE(nullptr, table);
    EXPECT_THAT(device_.logMessages(), IsEmpty());
    uxt_theme_delete_font_table(table);
}

TEST_F(Tables, AnEmptyTableIsATable) {
    uxt_font_table* const table = uxt_theme_add_font_table(file("<font_table/>").c_str());
    EXPECT_NE(nullptr, table);
    uxt_theme_delete_font_table(table);
}

struct Refusal {
    const char* name;
    const char* text;
    const char* message;
};

void PrintTo(const Refusal& refusal, std::ostream* stream) {
    *stream << refusal.name;
}

class RefusedColourTable : public Tables, public testing::WithParamInterface<Refusal> {};

TEST_P(RefusedColourTable, IsSaidWithFileAndLine) {
    const std::string path = file(GetParam().text);
    EXPECT_EQ(nullptr, uxt_theme_add_color_table(path.c_str()));
    EXPECT_THAT(device_.logMessages(), ElementsAre("E UXT " + path + GetParam().message));
}

INSTANTIATE_TEST_SUITE_P(
    Tables, RefusedColourTable,
    testing::Values(
        Refusal{"NoXml", "colours\n", ":1: error: Start tag expected, '<' not found"},
        Refusal{"Empty", "", ":1: error: Document is empty"},
        Refusal{"CutOff", "<color_table>\n  <color class=\"a\"\n",
                ":3: error: Couldn't find end of Start Tag color line 2"},
        Refusal{"AnotherRoot", "\n<colours/>", ":2: error: the root element is \"colours\", not \"color_table\""},
        Refusal{"AnotherElement", "<color_table>\n<font class=\"a\"/>\n</color_table>",
                ":2: error: \"color_table\" holds \"color\" elements only"},
        Refusal{"Text", "<color_table>\nred\n</color_table>",
                ":1: error: \"color_table\" holds \"color\" elements only"},
        Refusal{"NoDark", "<color_table>\n\n<color class=\"a\" light=\"#FFFFFF\"/>\n</color_table>",
                ":3: error: \"color\" needs the attribute \"dark\""},
        Refusal{"NoClass", "<color_table>\n<color class=\"\" light=\"#FFFFFF\" dark=\"#000000\"/>\n</color_table>",
                ":2: error: \"color\" needs the attribute \"class\""},
        Refusal{"AnotherAttribute",
                "<color_table>\n<color class=\"a\" lihgt=\"#FFFFFF\" dark=\"#000000\"/>\n</color_table>",
                ":2: error: \"color\" has no attribute \"lihgt\""},
        Refusal{"NoColour", "<color_table>\n<color class=\"a\" light=\"white\" dark=\"#000000\"/>\n</color_table>",
                ":2: error: \"white\" is no colour; write #RRGGBB or #RRGGBBAA"},
        Refusal{"NoHexDigit", "<color_table>\n<color class=\"a\" light=\"#12345G\" dark=\"#000000\"/>\n</color_table>",
                ":2: error: \"#12345G\" is no colour; write #RRGGBB or #RRGGBBAA"},
        Refusal{"Sign", "<color_table>\n<color class=\"a\" light=\"#-1+1 1\" dark=\"#000000\"/>\n</color_table>",
                ":2: error: \"#-1+1 1\" is no colour; write #RRGGBB or #RRGGBBAA"},
        Refusal{"MinusNought", "<color_table>\n<color class=\"a\" light=\"#-0-0-0\" dark=\"#000000\"/>\n</color_table>",
                ":2: error: \"#-0-0-0\" is no colour; write #RRGGBB or #RRGGBBAA"},
        Refusal{"Twice",
                "<color_table>\n<color class=\"a\" light=\"#FFFFFF\" dark=\"#000000\"/>\n"
                "<color class=\"a\" light=\"#FFFFFF\" dark=\"#000000\"/>\n</color_table>",
                ":3: error: \"a\" stands in line 2 already"},
        Refusal{"Nested",
                "<color_table>\n<color class=\"a\" light=\"#FFFFFF\" dark=\"#000000\">\n<b/></color>\n</color_table>",
                ":3: error: \"color\" holds nothing"},
        Refusal{"DocumentType",
                "<?xml version=\"1.0\"?>\n<!DOCTYPE color_table SYSTEM \"http://example.com/x.dtd\">\n<color_table/>",
                ":2: error: a document type is not allowed"},
        Refusal{"EntityBomb",
                "<!DOCTYPE a [\n<!ENTITY b \"bbbbbbbbbb\">\n<!ENTITY c \"&b;&b;&b;&b;&b;&b;&b;&b;\">\n"
                "<!ENTITY d \"&c;&c;&c;&c;&c;&c;&c;&c;\">]>\n<color_table><color class=\"&d;\"/></color_table>",
                ":1: error: a document type is not allowed"}),
    [](const auto& refusal) { return refusal.param.name; });

class RefusedFontTable : public Tables, public testing::WithParamInterface<Refusal> {};

TEST_P(RefusedFontTable, IsSaidWithFileAndLine) {
    const std::string path = file("<font_table>\n<font class=\"a\" font=\"Noto Sans\" size=\"" +
                                  std::string(GetParam().text) + "\"/>\n</font_table>");
    EXPECT_EQ(nullptr, uxt_theme_add_font_table(path.c_str()));
    EXPECT_THAT(device_.logMessages(), ElementsAre("E UXT " + path + ":2: error: \"" + GetParam().text +
                                                   "\" is no font size; write pixels from 1 to 999, or a percentage "
                                                   "such as 120%"));
}

INSTANTIATE_TEST_SUITE_P(Tables, RefusedFontTable,
                         testing::Values(Refusal{"Zero", "0", ""}, Refusal{"TooLarge", "1000", ""},
                                         Refusal{"Negative", "-20", ""}, Refusal{"Unit", "20px", ""},
                                         Refusal{"JustPercent", "%", ""},
                                         Refusal{"Overflow", "99999999999999999999", ""}),
                         [](const auto& refusal) { return refusal.param.name; });

TEST_F(Tables, AFileThatIsNotThereIsSaid) {
    const std::string path = device_.folder() / "none.xml";
    EXPECT_EQ(nullptr, uxt_theme_add_color_table(path.c_str()));
    EXPECT_EQ(nullptr, uxt_theme_add_font_table(path.c_str()));
    const std::string line = "E UXT " + path + ": error: cannot be opened: No such file or directory";
    EXPECT_THAT(device_.logMessages(), ElementsAre(line, line));
}

TEST_F(Tables, APipeADirectoryAndAHugeFileAreRefusedAtOnce) {
    const std::string pipe = device_.folder() / "pipe.xml";
    ASSERT_EQ(0, mkfifo(pipe.c_str(), 0600));
    EXPECT_EQ(nullptr, uxt_theme_add_color_table(pipe.c_str()));
    const std::string directory = device_.folder();
    EXPECT_EQ(nullptr, uxt_theme_add_color_table(directory.c_str()));
    const std::string huge = file("<color_table>" + std::string(1 << 20, ' ') + "</color_table>");
    EXPECT_EQ(nullptr, uxt_theme_add_color_table(huge.c_str()));
    EXPECT_THAT(device_.logMessages(), ElementsAre("E UXT " + pipe + ": error: is not a regular file",
                                                   "E UXT " + directory + ": error: is not a regular file",
                                                   "E UXT " + huge + ": error: is larger than 1 MiB"));
}

TEST_F(Tables, NoFileNameAndNoSuchTableAreSaid) {
    EXPECT_EQ(nullptr, uxt_theme_add_color_table(nullptr));
    EXPECT_EQ(nullptr, uxt_theme_add_font_table(""));
    uxt_theme_delete_color_table(nullptr);
    uxt_color_table* const table = uxt_theme_add_color_table(file("<color_table/>").c_str());
    uxt_theme_delete_color_table(table);
    uxt_theme_delete_color_table(table);
    EXPECT_THAT(device_.logMessages(), ElementsAre("E UXT uxt_theme_add_color_table: no file is named",
                                                   "E UXT uxt_theme_add_font_table: no file is named",
                                                   "E UXT uxt_theme_delete_color_table: there is no such table"));
}

}  // namespace
