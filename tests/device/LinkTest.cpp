#include "device/Link.h"

#include "device/Packages.h"
#include "support/Message.h"
#include "support/TemporaryFolder.h"

#include <gmock/gmock.h>

namespace {

using device::Extras;
using device::Link;
using support::messageOf;
using testing::ElementsAre;
using testing::Pair;

constexpr char form[] = "tea:{cup}{?sugar,milk}";

Extras open(const std::string& uri) {
    return Link(form).extrasOf(uri);
}

/// Why a link cannot be opened, without what is said of each.
std::string refusal(const std::string& uri) {
    const std::string message = messageOf([&] { open(uri); });
    const std::string begin = "cannot open \"" + uri + "\": ";
    const std::string end = std::string("; such a link is written ") + form;
    if (!message.starts_with(begin) || !message.ends_with(end))
        return "otherwise: " + message;
    return message.substr(begin.size(), message.size() - begin.size() - end.size());
}

std::string refusalOfForm(const std::string& text) {
    return messageOf([&] { Link link(text); });
}

/// What is said of a pattern for the links tea:{cup}{?milk}.
std::string refusalOfPattern(const std::string& name, const std::string& pattern) {
    return messageOf([&] { Link("tea:{cup}{?milk}").restrict(name, pattern); });
}

TEST(ALink, GivesTheExtrasThatItNames) {
    EXPECT_THAT(open("tea:green"), ElementsAre(Pair("cup", "green")));
    EXPECT_THAT(open("tea:green?milk=1&sugar=two"),
                ElementsAre(Pair("cup", "green"), Pair("milk", "1"), Pair("sugar", "two")));
    EXPECT_THAT(open("TEA:com.example-tea_1~!$&'()*+,;=:@"),
                ElementsAre(Pair("cup", "com.example-tea_1~!$&'()*+,;=:@")));
}

TEST(ALink, IsDecodedOnce) {
    EXPECT_THAT(open("tea:%2541%2F%3F%23?milk=a%26b%3Dc=d%20%C3%A4%0A"),
                ElementsAre(Pair("cup", "%41/?#"), Pair("milk", "a&b=c=d \xC3\xA4\n")));
    EXPECT_THAT(open("tea:a+b?milk=%2500"), ElementsAre(Pair("cup", "a+b"), Pair("milk", "%00")));
}

TEST(ALink, OfAnotherKindIsRefused) {
    for (const char* uri : {"coffee:green", "green", "", "/green", "file:///etc/passwd", "tea.x:green"})
        EXPECT_EQ(refusal(uri), "it does not begin with \"tea:\"") << uri;
    EXPECT_EQ(refusal("tea://host/green"), "it names a host");
    EXPECT_EQ(refusal("tea:///green"), "it names a host");
    EXPECT_EQ(refusal("tea:green#top"), "it has a fragment");
    EXPECT_EQ(refusal("tea:green#"), "it has a fragment");
}

TEST(ALink, ThatIsNoUriIsRefused) {
    for (const char* uri : {"tea:gr een", "tea:gr%zzeen", "tea:green?milk=%", "tea:caf\xC3\xA9", "tea:<b>", "tea:a\"b"})
        EXPECT_EQ(refusal(uri), "it is no URI") << uri;
    EXPECT_EQ(messageOf([] { open("tea:a\nb"); }),
              "cannot open \"tea:a b\": it is no URI; such a link is written tea:{cup}{?sugar,milk}");
}

TEST(ALink, MustSayWhatItNames) {
    EXPECT_EQ(refusal("tea:"), "its \"cup\" is empty");
    EXPECT_EQ(refusal("tea:?milk=1"), "its \"cup\" is empty");
    EXPECT_EQ(refusal("tea:green?milk="), "its \"milk\" is empty");
    EXPECT_EQ(refusal("tea:green/black"), "its \"cup\" has a \"/\"");
    EXPECT_EQ(refusal("tea:/green"), "its \"cup\" has a \"/\"");
}

TEST(ALink, MustBeText) {
    EXPECT_EQ(refusal("tea:caf%E9"), "its \"cup\" is not UTF-8");
    EXPECT_EQ(refusal("tea:green?milk=%ff"), "its \"milk\" is not UTF-8");
    EXPECT_EQ(refusal("tea:green?milk=a%00b"), "its \"milk\" has a zero byte");
}

TEST(ALink, NamesNothingElseAndNothingTwice) {
    EXPECT_EQ(refusal("tea:green?lemon=1"), "nothing in it may be called \"lemon\"");
    EXPECT_EQ(refusal("tea:green?cup=black"), "nothing in it may be called \"cup\"");
    EXPECT_EQ(refusal("tea:green?=1"), "nothing in it may be called \"\"");
    EXPECT_EQ(refusal("tea:green?milk=1&milk=2"), "it gives \"milk\" twice");
    EXPECT_EQ(refusal("tea:green?milk"), "its query has \"milk\", which is not NAME=VALUE");
    EXPECT_EQ(refusal("tea:green?"), "its query has \"\", which is not NAME=VALUE");
    EXPECT_EQ(refusal("tea:green?milk=1&"), "its query has \"\", which is not NAME=VALUE");
}

TEST(ALink, OfAnyLengthIsRefusedOnOneLine) {
    EXPECT_EQ(messageOf([] { open("tea:" + std::string(1 << 23, 'x')); }),
              "cannot open \"tea:" + std::string(196, 'x') +
                  "...\": it is longer than 64 KiB; such a link is written tea:{cup}{?sugar,milk}");
}

TEST(ALink, HasValuesOfTheirPatterns) {
    Link link("tea:{cup}{?sugar,milk}");
    link.restrict("sugar", "[0-9]+");
    link.restrict("cup", R"([a-z]+(\.[a-z]+)+)");
    EXPECT_THAT(link.extrasOf("tea:green.leaf?sugar=10&milk=*"),
                ElementsAre(Pair("cup", "green.leaf"), Pair("sugar", "10"), Pair("milk", "*")));
    EXPECT_THAT(link.extrasOf("tea:green%2Eleaf?sugar=%31"),
                ElementsAre(Pair("cup", "green.leaf"), Pair("sugar", "1")));
    const std::string end = "; such a link is written tea:{cup}{?sugar,milk}";
    EXPECT_EQ(messageOf([&] { link.extrasOf("tea:a.b?sugar=1a"); }),
              "cannot open \"tea:a.b?sugar=1a\": its \"sugar\" is \"1a\", which does not match [0-9]+" + end);
    EXPECT_EQ(messageOf([&] { link.extrasOf("tea:a.b?sugar=1%0A2"); }),
              "cannot open \"tea:a.b?sugar=1%0A2\": its \"sugar\" is \"1 2\", which does not match [0-9]+" + end);
    EXPECT_EQ(messageOf([&] { link.extrasOf("tea:!!!?sugar=1"); }),
              "cannot open \"tea:!!!?sugar=1\": its \"cup\" is \"!!!\", which does not match [a-z]+(\\.[a-z]+)+" + end);
}

TEST(ALink, HasValuesOf255BytesWhereTheyMatchAPattern) {
    Link link("tea:{cup}{?milk}");
    link.restrict("cup", "(x|y)*");
    const std::string longest(255, 'x');
    EXPECT_THAT(link.extrasOf("tea:" + longest + "?milk=1" + longest),
                ElementsAre(Pair("cup", longest), Pair("milk", "1" + longest)));
    EXPECT_EQ(messageOf([&] { link.extrasOf("tea:x" + longest); }),
              "cannot open \"tea:" + std::string(196, 'x') +
                  "...\": its \"cup\" is longer than 255 bytes; such a link is written tea:{cup}{?milk}");
}

TEST(AFormOfLinks, HasPatternsThatAreSome) {
    for (const std::string& pattern :
         {std::string("["), std::string("(a"), std::string("*"), std::string(), std::string(1001, 'a')})
        EXPECT_EQ(refusalOfPattern("cup", pattern), "the pattern for \"cup\" in links, \"" + pattern.substr(0, 200) +
                                                        (pattern.size() > 200 ? "..." : "") +
                                                        "\", is no regular expression of up to 1000 characters");
    EXPECT_EQ(refusalOfPattern("lemon", "a"),
              "there is a pattern for \"lemon\", a name that the links tea:{cup}{?milk} do not have");
    Link link("tea:{cup}");
    link.restrict("cup", "a");
    EXPECT_EQ(messageOf([&] { link.restrict("cup", "b"); }),
              "there is a second pattern for \"cup\" in links; a name has one");
    EXPECT_EQ(refusalOfForm("tea:{cup}\ncup=a"),
              "\"tea:{cup} cup=a\" is no form of links; write SCHEME:{NAME} or SCHEME:{NAME}{?NAME,NAME}");
}

TEST(AFormOfLinks, HasASchemeAndNames) {
    EXPECT_EQ(Link("tea:{cup}").form(), "tea:{cup}");
    EXPECT_THAT(Link("x+y-1.0:{a_1}{?b}").extrasOf("X+Y-1.0:c?b=d"), ElementsAre(Pair("a_1", "c"), Pair("b", "d")));
    for (const char* text : {"", "tea", "tea:", "tea:cup", "tea:{}", "1tea:{cup}", "tea:{cup}{?}", "tea:{cup}{?a,}",
                             "tea:{cup}{&a}", "tea://{cup}", "tea:{cup}/{a}", "tea:{cup} "})
        EXPECT_EQ(refusalOfForm(text),
                  '"' + std::string(text) + "\" is no form of links; write SCHEME:{NAME} or SCHEME:{NAME}{?NAME,NAME}");
    EXPECT_EQ(refusalOfForm("tea:{cup}{?a,cup}"),
              "\"tea:{cup}{?a,cup}\" is no form of links: it has the name \"cup\" twice");
    EXPECT_THAT(refusalOfForm("tea:{" + std::string(1 << 20, 'a') + "}"), testing::HasSubstr("is no form of links"));
}

class LinkInManifest : public testing::Test {
protected:
    device::Package packageWith(const std::string& metadata) const {
        support::writeFile(folder_.path() / "tizen-manifest.xml",
                           "<manifest package=\"com.example.tea\">\n<ui-application appid=\"com.example.tea\">\n" +
                               metadata + "\n</ui-application>\n</manifest>");
        return device::readManifest(folder_.path());
    }
    /// What is said of the manifest behind its path.
    std::string faultOf(const std::string& metadata) const {
        const std::string message = messageOf([&] { packageWith(metadata); });
        const std::string file = (folder_.path() / "tizen-manifest.xml").string();
        return message.starts_with(file) ? message.substr(file.size()) : "otherwise: " + message;
    }

    support::TemporaryFolder folder_;
};

TEST_F(LinkInManifest, IsTheApplicationsMetadata) {
    EXPECT_FALSE(packageWith("").link.has_value());
    EXPECT_FALSE(packageWith("<metadata key=\"other\" value=\"tea:{cup}\"/>").link.has_value());
    const auto package =
        packageWith("<metadata key=\"other\" value=\"1\"/><metadata key=\"link\" value=\"tea:{cup}\"/>");
    ASSERT_TRUE(package.link.has_value());
    EXPECT_EQ(package.link->form(), "tea:{cup}");
}

TEST_F(LinkInManifest, IsRefusedWhereItIsNone) {
    EXPECT_EQ(faultOf("<metadata key=\"link\" value=\"tea\"/>"),
              ":3: \"tea\" is no form of links; write SCHEME:{NAME} or SCHEME:{NAME}{?NAME,NAME}");
    EXPECT_EQ(faultOf("<metadata key=\"link\"/>"),
              ":3: \"\" is no form of links; write SCHEME:{NAME} or SCHEME:{NAME}{?NAME,NAME}");
    EXPECT_EQ(faultOf("<metadata key=\"link\" value=\"tea:{cup}\"/>\n<metadata key=\"link\" value=\"tea:{cup}\"/>"),
              ":4: there is a second form of links; an application has one");
}

TEST_F(LinkInManifest, HasPatternsInAnyOrder) {
    const auto package = packageWith("<metadata key=\"link.milk\" value=\"[0-9]+\"/>"
                                     "<metadata key=\"link\" value=\"tea:{cup}{?milk}\"/>"
                                     "<metadata key=\"link.cup\" value=\"a=[a-z]&lt;\"/>");
    ASSERT_TRUE(package.link.has_value());
    EXPECT_THAT(package.link->extrasOf("tea:a=b%3C?milk=1"), ElementsAre(Pair("cup", "a=b<"), Pair("milk", "1")));
    EXPECT_EQ(messageOf([&] { package.link->extrasOf("tea:a=b%3C?milk=x"); }),
              "cannot open \"tea:a=b%3C?milk=x\": its \"milk\" is \"x\", which does not match [0-9]+; such a link is "
              "written tea:{cup}{?milk}");
    EXPECT_NE(messageOf([&] { package.link->extrasOf("tea:a?milk=1"); }), "");
}

TEST_F(LinkInManifest, IsRefusedForAPatternThatIsNone) {
    const auto faultOfPattern = [this](const std::string& attributes) {
        return faultOf("<metadata key=\"link\" value=\"tea:{cup}\"/>\n<metadata " + attributes + "/>");
    };
    const std::string end = ", is no regular expression of up to 1000 characters";
    EXPECT_EQ(faultOfPattern(R"(key="link.cup" value="[")"), ":4: the pattern for \"cup\" in links, \"[\"" + end);
    EXPECT_EQ(faultOfPattern(R"(key="link.cup")"), ":4: the pattern for \"cup\" in links, \"\"" + end);
    for (const std::string name : {"lemon", ""})
        EXPECT_EQ(faultOfPattern("key=\"link." + name + "\" value=\"a\""),
                  ":4: there is a pattern for \"" + name + "\", a name that the links tea:{cup} do not have");
    EXPECT_EQ(faultOfPattern(R"(key="link.cup=a" value="a")"),
              ":4: there is a pattern for \"cup=a\", a name that the links tea:{cup} do not have");
    EXPECT_EQ(faultOfPattern(R"(key="link.cup" value="a"/><metadata key="link.cup" value="b")"),
              ":4: there is a second pattern for \"cup\" in links; a name has one");
    EXPECT_EQ(faultOf("<metadata key=\"link.cup\" value=\"a\"/>"),
              ":3: there is a pattern for \"cup\", but no form of links");
}

}  // namespace
