#include "PlainLine.h"

#include <gtest/gtest.h>

namespace {

std::string times(int count, const std::string& text) {
    std::string all;
    for (int number = 0; number < count; ++number)
        all += text;
    return all;
}

TEST(PlainLine, LeavesPlainTextAsItIs) {
    for (const char* text : {"", "page: walk", "<b>bold</b> & &lt;", "한국어", "\xF0\x9F\x8D\xB5 tea", "مرحبا"})
        EXPECT_EQ(plainLine(text), text);
}

TEST(PlainLine, MakesBlanksOfLineBreaksAndOtherControlCharacters) {
    EXPECT_EQ(plainLine("a\nb\tc\x1b[31m\x7f"), "a b c [31m ");
    EXPECT_EQ(plainLine("a\xE2\x80\xA8\x62\xE2\x80\xA9\x63"), "a b c") << "line and paragraph separators";
    EXPECT_EQ(plainLine("a\xC2\x85\x62"), "a b");
}

TEST(PlainLine, ShowsWhereBytesAreNoText) {
    EXPECT_EQ(plainLine("caf\xE9"), "caf\xEF\xBF\xBD");
    EXPECT_EQ(plainLine("\xFF\xFE<b>"), "\xEF\xBF\xBD\xEF\xBF\xBD<b>");
    EXPECT_EQ(plainLine("\xE2\x82"), "\xEF\xBF\xBD\xEF\xBF\xBD") << "a character that is cut short";
    EXPECT_EQ(plainLine("\xED\xA0\x80"), "\xEF\xBF\xBD") << "half of a surrogate pair";
}

TEST(PlainLine, CutsALongText) {
    EXPECT_EQ(plainLine(std::string(200, 'x')), std::string(200, 'x'));
    EXPECT_EQ(plainLine(std::string(201, 'x')), std::string(200, 'x') + "…");
    EXPECT_EQ(plainLine(times(1 << 20, "한")), times(200, "한") + "…");
}

}  // namespace
