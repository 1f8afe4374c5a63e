#include "DrawnMarkup.h"

#include <gtest/gtest.h>

namespace {

using efl_answers::drawnMarkup;

std::string drawn(const std::string& markup) {
    return drawnMarkup(markup, false);
}

TEST(DrawnMarkup, HasALookAroundEveryLink) {
    EXPECT_EQ("One <link><a href=app>two</a></link> three", drawn("One <a href=app>two</a> three"));
    EXPECT_EQ("<link><a href=x>1</a></link><link><a href=y>2</a></link>", drawn("<a href=x>1</a><a href=y>2</a>"));
    EXPECT_EQ("<link><a>1</a></link>", drawn("<a>1</a>"));
}

TEST(DrawnMarkup, HasOneWhereALinkIsClosedByTheTagThatClosesTheLastOne) {
    EXPECT_EQ("<font_size=36>x<link><a href=app>y</></link>z</>", drawn("<font_size=36>x<a href=app>y</>z</>"));
    EXPECT_EQ("<link><a href=app><b>y</></></link>z", drawn("<a href=app><b>y</></>z"));
}

TEST(DrawnMarkup, HasItEndWithTheLinkWhateverIsInside) {
    EXPECT_EQ("<link><a href=app><b>y</b><br/>z</a></link><b>t</b>", drawn("<a href=app><b>y</b><br/>z</a><b>t</b>"));
    EXPECT_EQ("<link><a href=app>y<br>z</></link>", drawn("<a href=app>y<br>z</>"));
    EXPECT_EQ("<link><a href=app><item size=40x40 href=file:x></item></a></link>",
              drawn("<a href=app><item size=40x40 href=file:x></item></a>"));
}

TEST(DrawnMarkup, IsAsWrittenWhereThereIsNoLink) {
    for (const char* markup : {"", "text", "<b>bold</b>", "<align=center>x</align>", "<abc>x</abc>", "&lt;a&gt;"})
        EXPECT_EQ(markup, drawn(markup));
}

TEST(DrawnMarkup, OfBrokenMarkupLosesNothing) {
    for (const char* markup : {"a < b", "<", "<b", "</a>", "</>", "<>", "x</b></i>", "<a", ">"})
        EXPECT_EQ(markup, drawn(markup));
    EXPECT_EQ("<link><a href=app>never closed", drawn("<a href=app>never closed"));
}

TEST(DrawnMarkup, BeginsWhereItsLanguageBeginsWhereOneReadsFromRightToLeft) {
    const std::string written = "<font_style='Regular' font_size=36 align=left linegap=10>text</>";
    EXPECT_EQ("<font_style='Regular' font_size=36 align=auto linegap=10>text</>", drawnMarkup(written, true));
    EXPECT_EQ(written, drawnMarkup(written, false));
    EXPECT_EQ("<align=auto>x</align>", drawnMarkup("<align=left>x</align>", true));
    EXPECT_EQ("<b align=auto>x", drawnMarkup("<b align=left>x", true));
    for (const char* other : {"<align=center>x", "<align=right>x", "<valign=left>x", "<b align=lefty>x", "align=left"})
        EXPECT_EQ(other, drawnMarkup(other, true));
}

TEST(DrawnMarkup, OfAThousandLinksIsMadeAtOnce) {
    std::string written;
    std::string expected;
    for (int i = 0; i < 1000; ++i) {
        written += "<a href=app>open</a> ";
        expected += "<link><a href=app>open</a></link> ";
    }
    EXPECT_EQ(expected, drawn(written));
}

}  // namespace
