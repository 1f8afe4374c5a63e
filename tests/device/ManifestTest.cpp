#include "support/Message.h"
#include "support/TemporaryDevice.h"

#include <gtest/gtest.h>

#include <sys/stat.h>

namespace {

using device::readManifest;
using support::messageOf;
using support::TemporaryFolder;
using support::writeFile;

class Manifest : public testing::Test {
protected:
    /// What is said of a package with this manifest, without the path of the file.
    std::string messageFor(const std::string& text) const {
        writeFile(file, text);
        const std::string message = messageOf([&] { readManifest(folder.path()); });
        EXPECT_EQ(message.rfind(file.string(), 0), 0U) << message;
        return message.substr(file.string().size());
    }

    TemporaryFolder folder;
    std::filesystem::path file = folder.path() / "tizen-manifest.xml";
};

TEST_F(Manifest, TellsEverythingOfThePackage) {
    writeFile(file, R"(<?xml version="1.0" encoding="UTF-8"?>
<manifest xmlns="http://tizen.org/ns/packages" api-version="2.4" package="com.example.tea" version="2.1.0">
    <profile name="wearable"/>
    <ui-application appid="com.example.tea" exec="tea" type="capp">
        <label xml:lang="ko-kr">차</label>
        <label>
            Tea &amp; more
        </label>
        <icon>icons/tea.png</icon>
    </ui-application>
    <ui-application appid="com.example.tea.second" exec="second"/>
</manifest>)");
    const device::Package package = readManifest(folder.path());
    EXPECT_EQ(package.id, "com.example.tea");
    EXPECT_EQ(package.version, "2.1.0");
    EXPECT_EQ(package.label, "Tea & more");
    EXPECT_EQ(package.icon, (folder.path() / "shared/res/icons/tea.png").string());
    EXPECT_EQ(package.exec, (folder.path() / "bin/tea").string());
    EXPECT_EQ(package.root, folder.path());
}

TEST_F(Manifest, NeedsNothingButTheId) {
    writeFile(file, R"(<manifest package="com.example.tea"/>)");
    const device::Package package = readManifest(folder.path());
    EXPECT_EQ(package.id, "com.example.tea");
    EXPECT_EQ(package.version, "");
    EXPECT_EQ(package.label, "com.example.tea");
    EXPECT_EQ(package.icon, "");
    EXPECT_EQ(package.exec, "");
}

TEST_F(Manifest, MustBeThere) {
    EXPECT_EQ(messageOf([&] { readManifest(folder.path()); }),
              file.string() +
                  ": cannot be read: No such file or directory; a package has a tizen-manifest.xml in its folder");
}

TEST_F(Manifest, MustBeAFile) {
    std::filesystem::create_directory(file);
    EXPECT_EQ(messageOf([&] { readManifest(folder.path()); }), file.string() + ": is not a file");
    std::filesystem::remove(file);
    ASSERT_EQ(mkfifo(file.c_str(), 0600), 0);
    EXPECT_EQ(messageOf([&] { readManifest(folder.path()); }), file.string() + ": is not a file");
}

TEST_F(Manifest, MustBeWellFormed) {
    EXPECT_EQ(messageFor("<manifest package=\"com.example.tea\">\n<oops>\n</manifest>"),
              ":3: is not well-formed XML: Premature end of data in tag manifest line 1");
    EXPECT_EQ(messageFor(""), ":1: is not well-formed XML: Document is empty");
    EXPECT_EQ(messageFor("plain text"), ":1: is not well-formed XML: Start tag expected, '<' not found");
}

TEST_F(Manifest, MustNotBeLargerThanAMebibyte) {
    EXPECT_EQ(messageFor("<manifest package=\"com.example.tea\">" + std::string(1 << 20, ' ') + "</manifest>"),
              ": is larger than 1 MiB; a manifest is not");
}

TEST_F(Manifest, MustNotDefineEntities) {
    EXPECT_EQ(messageFor("<!DOCTYPE m [<!ENTITY a \"aaaaaaaaaa\"><!ENTITY b \"&a;&a;&a;&a;\">]>\n"
                         "<manifest package=\"com.example.tea\"/>"),
              ": has a document type; remove the <!DOCTYPE>");
}

TEST_F(Manifest, IsNotReadPastADocumentTypeThatWouldGrowWithoutEnd) {
    std::string bomb = "<!DOCTYPE m [<!ENTITY e0 \"aaaaaaaaaa\">";
    for (int level = 1; level < 30; ++level) {
        const std::string inner = "&e" + std::to_string(level - 1) + ";";
        bomb += "<!ENTITY e" + std::to_string(level) + " \"" + inner + inner + inner + inner + "\">";
    }
    EXPECT_NE(messageFor(bomb + "]><manifest package=\"&e29;\"/>"), "no error");
}

TEST_F(Manifest, DoesNotFetchWhatItNames) {
    const std::filesystem::path secret = folder.path() / "secret";
    writeFile(secret, "com.example.secret");
    EXPECT_EQ(messageFor("<!DOCTYPE m SYSTEM \"" + secret.string() + "\"><manifest package=\"com.example.tea\"/>"),
              ": has a document type; remove the <!DOCTYPE>");
}

TEST_F(Manifest, MustHaveTheRightRoot) {
    EXPECT_EQ(messageFor("\n<package/>"), ":2: the root element must be <manifest>");
}

TEST_F(Manifest, MustNameAPackageId) {
    EXPECT_EQ(messageFor("<manifest/>"), ":1: <manifest> has no package id; give it the attribute package=\"...\"");
    for (const char* id : {"../x", "tea", "com.example/tea", "com.7up", ".com.example", "com.example tea"})
        EXPECT_EQ(messageFor("<manifest package=\"" + std::string(id) + "\"/>"),
                  ":1: \"" + std::string(id) +
                      "\" is no package id; it needs two or more words of letters, digits, '-' and '_', joined by "
                      "dots");
}

TEST_F(Manifest, MustNameItsApplicationAsThePackage) {
    EXPECT_EQ(messageFor("<manifest package=\"com.example.tea\">\n<ui-application appid=\"com.example.other\"/>"
                         "</manifest>"),
              ":2: the application's id \"com.example.other\" differs from the package's, \"com.example.tea\"; they "
              "must be equal");
}

TEST_F(Manifest, MustNotLeadOutOfThePackage) {
    for (const char* icon : {"../../../secret.png", "/etc/passwd", "a/../../b.png", ".."})
        EXPECT_EQ(messageFor("<manifest package=\"com.example.tea\">\n<ui-application appid=\"com.example.tea\">\n"
                             "<icon>" +
                             std::string(icon) + "</icon></ui-application></manifest>"),
                  ":3: \"" + std::string(icon) + "\" leads out of the package; give a path below " +
                      (folder.path() / "shared/res").string());
    EXPECT_EQ(messageFor("<manifest package=\"com.example.tea\">\n<ui-application appid=\"com.example.tea\" "
                         "exec=\"../../sh\"/></manifest>"),
              ":2: \"../../sh\" leads out of the package; give a path below " + (folder.path() / "bin").string());
}

}  // namespace
