#include "Markup.h"

#include <gmock/gmock.h>

namespace catalogue {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(Markup, IsBalanced) {
    EXPECT_THAT(markupProblems("a<br/><b>b</b> <font_size=16><br/></> <a href=app>c &amp; d</a>"), IsEmpty());
    EXPECT_THAT(markupProblems("<item size=40x40 vsize=full href=file:a.png></item>"), IsEmpty());
}

TEST(Markup, WithATagLeftOpenIsRefused) {
    EXPECT_THAT(markupProblems("<b>bold"), ElementsAre("<b> is not closed"));
}

TEST(Markup, WithATagThatClosesAnotherIsRefused) {
    EXPECT_THAT(markupProblems("<a href=app><b>c</a></b>"), ElementsAre("</a> closes <b>", "</b> closes <a>"));
}

TEST(Markup, WithATagThatClosesNothingIsRefused) {
    EXPECT_THAT(markupProblems("a</b>"), ElementsAre("</b> closes nothing"));
    EXPECT_THAT(markupProblems("a</>"), ElementsAre("</> closes nothing"));
}

TEST(Markup, WithAStrayBracketIsRefused) {
    EXPECT_THAT(markupProblems("a < b"), ElementsAre("a \"<\" begins no tag"));
    EXPECT_THAT(markupProblems("a <> b"), ElementsAre("a \"<\" begins no tag"));
    EXPECT_THAT(markupProblems("a <b <i>c</i>"), ElementsAre("a \"<\" begins no tag"));
}

TEST(Markup, WithAStrayAmpersandIsRefused) {
    EXPECT_THAT(markupProblems("salt & pepper &amp; oil"), ElementsAre("an \"&\" begins no entity"));
}

const std::string link = "<br/><a href=app><text id=\"IDS_OPEN\"></text></a>";

TEST(Contents, MayEndALineBeforeABreak) {
    EXPECT_THAT(contentsProblems("<text id=\"IDS_A\"></text>\n" + link), IsEmpty());
}

TEST(Contents, MayHoldAFallbackText) {
    EXPECT_THAT(contentsProblems("<text id=\"IDS_A\">Hello</text>" + link), IsEmpty());
}

TEST(Contents, WithALineThatEndsElsewhereAreRefused) {
    const std::string problem =
        "a line ends elsewhere than right before <br/>, so that the line's end shows as a blank";
    EXPECT_THAT(contentsProblems("<br/>\n<text id=\"IDS_A\"></text>" + link), ElementsAre(problem));
    EXPECT_THAT(contentsProblems("<text id=\"IDS_A\"></text> \n" + link), ElementsAre(problem));
    EXPECT_THAT(contentsProblems("<text id=\"IDS_A\"></text>\n  " + link), ElementsAre(problem));
}

TEST(Contents, WithATextTagOfAnotherFormAreRefused) {
    const std::string problem = "a text tag is not of the form <text id=\"IDS_NAME\"></text>";
    EXPECT_THAT(contentsProblems("<text id=\"IDS_A\" ></text>" + link), ElementsAre(problem));
    EXPECT_THAT(contentsProblems("<text id='IDS_A'></text>" + link), ElementsAre(problem));
    EXPECT_THAT(contentsProblems("<text id=\"\"></text>" + link), ElementsAre(problem));
    EXPECT_THAT(contentsProblems("<text id=\"IDS_A\"/>" + link), ElementsAre(problem));
}

TEST(Contents, WithoutALinkAreRefused) {
    EXPECT_THAT(contentsProblems("<text id=\"IDS_A\"></text>"),
                ElementsAre("no link <a href=app> opens the application"));
}

TEST(Contents, WithAPictureAreRefused) {
    EXPECT_THAT(contentsProblems("<item href=file:a.png></item>" + link),
                ElementsAre("a picture stands in the contents, where a language without a title loses it; attach it"));
}

TEST(Contents, NameTheirTextsAndFiles) {
    EXPECT_THAT(textIdsOf("<text id=\"IDS_A\"></text>" + link), ElementsAre("IDS_A", "IDS_OPEN"));
    EXPECT_THAT(filesOf("<item href=file:a/b.png></item><item href=file:c.png size=1x1></item>"),
                ElementsAre("a/b.png", "c.png"));
}

TEST(Contents, AreTranslatedWithGapsAndEscapes) {
    const auto translate = [](const std::string& id) { return id == "IDS_A" ? "x\ny\\nz" : "A & B"; };
    EXPECT_EQ("x<font_size=16><br/></>y<font_size=16><br/></>z<br/><a href=app>A &amp; B</a>",
              translateContents("<text id=\"IDS_A\"></text>" + link, translate));
}

}  // namespace
}  // namespace catalogue
