#pragma once

#include "HostileTest.h"

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
    /// Every element with a prefix asks for it among all namespaces in force.
    static std::string withNamespaces(int count, const std::string& elements) {
        std::string all;
        for (int i = 0; i < count; ++i)
            all += " xmlns:n" + std::to_string(i) + "='n'";
        return "<tip" + all + "><items><item>" + elements + "<title>Title</title></item></items></tip>";
    }
    void expectNotParsed(const std::string& text) {
        EXPECT_EQ(loadDetail(text).menuTitle, "");
        EXPECT_THAT(errors(), testing::Contains(manager_log::error("__loadDetailMenu", "Failed to xmlReadFile")));
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
