#include "Texts.h"

#include "support/TemporaryFolder.h"

#include <cstdio>
#include <gmock/gmock.h>
#include <regex>
#include <set>
#include <sys/wait.h>

namespace catalogue {
namespace {

namespace fs = std::filesystem;

const fs::path project = PROJECT_FOLDER;

struct Outcome {
    int status = -1;
    std::string output;
};

Outcome run(const std::string& command) {
    Outcome outcome;
    FILE* pipe = popen((command + " 2>&1").c_str(), "r");
    if (!pipe)
        return outcome;
    char block[4096];
    for (std::size_t got = 0; (got = fread(block, 1, sizeof(block), pipe)) > 0;)
        outcome.output.append(block, got);
    const int status = pclose(pipe);
    outcome.status = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    return outcome;
}

Outcome checkFormats(const fs::path& texts) {
    return run("cd '" + texts.parent_path().string() + "' && '" CMAKE_PROGRAM "' -D TEXTS='" + texts.string() +
               "' -D MSGFMT='" MSGFMT_PROGRAM "' -P '" PROJECT_FOLDER "/cmake/CheckFormats.cmake'");
}

/// The ids of a .po file, without its header; each has to be one line.
std::set<std::string> idsIn(const fs::path& file) {
    const std::string text = support::readFile(file);
    static const std::regex message("(?:^|\n)msgid \"([^\"]+)\"\nmsgstr \"[^\"]+\"");
    std::set<std::string> ids;
    for (std::sregex_iterator found(text.begin(), text.end(), message), end; found != end; ++found)
        ids.insert((*found)[1]);
    return ids;
}

struct Translations {
    std::string folder;
    std::string domain;

    fs::path in(const std::string& language) const {
        return project / folder / language / "LC_MESSAGES" / (domain + ".po");
    }
};

void PrintTo(const Translations& translations, std::ostream* stream) {
    *stream << translations.domain;
}

class Domain : public testing::TestWithParam<Translations> {};

TEST_P(Domain, HasEveryTextInEveryLanguage) {
    const std::set<std::string> ids = idsIn(GetParam().in("en_US"));
    EXPECT_FALSE(ids.empty());
    for (const std::string& language : languagesIn(DEVICE_TEXTS))
        EXPECT_EQ(ids, idsIn(GetParam().in(language))) << language;
}

TEST_P(Domain, HasNoUnsafeFormat) {
    for (const std::string& language : languagesIn(DEVICE_TEXTS)) {
        const support::TemporaryFolder copy;
        const fs::path file = copy.path() / "texts.po";
        fs::copy(GetParam().in(language), file);
        const Outcome outcome = checkFormats(file);
        EXPECT_EQ(0, outcome.status) << language << ": " << outcome.output;
    }
}

INSTANTIATE_TEST_SUITE_P(Texts, Domain,
                         testing::Values(Translations{"res/locale", "kest"},
                                         Translations{"platform/locale", "sys_string"}),
                         [](const auto& instance) { return instance.param.domain; });

TEST(Texts, OfTheApplicationAndTheDeviceHaveTheSameLanguages) {
    EXPECT_THAT(languagesIn(DEVICE_TEXTS),
                testing::IsSupersetOf({"ar_AE", "de_DE", "en_US", "hi_IN", "id_ID", "ko_KR", "ru_RU", "zh_CN"}));
    EXPECT_EQ(languagesIn(DEVICE_TEXTS), languagesIn(APPLICATION_TEXTS));
}

TEST(Texts, OfTheApplicationAreWhatItShows) {
    EXPECT_EQ("Tips", sharedText("en_US", "IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME"));
    EXPECT_EQ("Tips and guidelines", sharedText("en_US", "IDS_VOICE_BUTTON_TIPS_AND_GUIDELINES_ABB"));
    EXPECT_EQ("Tips %d/%d", sharedText("en_US", "IDS_KESTS_HEADER_KESTS_HP1SD_P2SD_ABB"));
    EXPECT_EQ("Discover useful features here.",
              sharedText("en_US", "IDS_KESTS_SBODY_DISCOVER_USEFUL_FEATURES_HERE_ABB"));
    EXPECT_EQ("팁", sharedText("ko_KR", "IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME"));
    EXPECT_EQ("Советы", sharedText("ru_RU", "IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME"));
    EXPECT_EQ("Tipps", sharedText("de_DE", "IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME"));
    EXPECT_EQ("टिप्स", sharedText("hi_IN", "IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME"));
    EXPECT_EQ("نصائح", sharedText("ar_AE", "IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME"));
    EXPECT_EQ("使用技巧", sharedText("zh_CN", "IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME"));
    EXPECT_EQ(std::nullopt, sharedText("en_US", "IDS_UNKNOWN"));
}

TEST(Texts, OfThePagesTitleAreMarkedAsAFormatInEveryLanguage) {
    for (const std::string& language : languagesIn(APPLICATION_TEXTS)) {
        const std::string text = support::readFile(project / "res/locale" / language / "LC_MESSAGES/kest.po");
        EXPECT_NE(std::string::npos, text.find("#. Format: %d/%d\nmsgid \"IDS_KESTS_HEADER_KESTS_HP1SD_P2SD_ABB\"\n"))
            << language;
    }
}

TEST(Texts, WithAnUnsafeFormatAreRefusedWhenTheyAreCompiled) {
    const support::TemporaryFolder folder;
    const fs::path file = folder.path() / "texts.po";
    support::writeFile(file, "msgid \"\"\nmsgstr \"Content-Type: text/plain; charset=UTF-8\\n\"\n\n"
                             "#. Format: %d/%d\nmsgid \"IDS_PAGE\"\nmsgstr \"Page %s of %d\"\n");
    const Outcome outcome = checkFormats(file);
    EXPECT_EQ(1, outcome.status);
    EXPECT_EQ(file.string() + ":6: format specifications in 'msgid' and 'msgstr' for argument 1 are not the same",
              outcome.output.substr(0, outcome.output.find('\n')));
}

}  // namespace
}  // namespace catalogue
