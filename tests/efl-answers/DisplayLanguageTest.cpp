#include "support/Environment.h"
#include "support/TemporaryFolder.h"

#include <efl-answers/DisplayLanguage.h>
#include <gtest/gtest.h>

#include <langinfo.h>
#include <libintl.h>
#include <locale.h>

#include <filesystem>
#include <ostream>
#include <string>
#include <vector>

namespace fs = std::filesystem;

/// The C library takes LOCPATH apart anew for every locale and keeps the parts.
extern "C" const char* __lsan_default_suppressions() {
    return "leak:__argz_add_sep\n";
}

namespace {

TEST(DisplayLanguageName, LosesItsCodesetAndKeepsItsModifier) {
    EXPECT_EQ("ko_KR", DisplayLanguage("ko_KR.UTF-8").name());
    EXPECT_EQ("ko_KR", DisplayLanguage("ko_KR.EUC-KR").name());
    EXPECT_EQ("ko", DisplayLanguage("ko").name());
    EXPECT_EQ("sr_RS@latin", DisplayLanguage("sr_RS.UTF-8@latin").name());
    EXPECT_EQ("sr_RS@latin", DisplayLanguage("sr_RS@latin").name());
}

TEST(DisplayLanguageName, IsEmptyWhereNothingIsTranslated) {
    for (const char* name : {"", "C", "POSIX", "C.UTF-8", ".UTF-8", "@latin"})
        EXPECT_EQ("", DisplayLanguage(name).name()) << name;
}

TEST(DisplayLanguageName, IsEmptyForWhatWouldLeadOutOfTheCatalogues) {
    for (const char* name : {"../../etc", "ko/KR", "ko:ru", "ko KR", "ko_KR@../x"})
        EXPECT_EQ("", DisplayLanguage(name).name()) << name;
}

TEST(DisplayLanguageDirection, IsRightToLeftWhereItsScriptIs) {
    for (const char* name : {"ar", "ar_EG", "ar_EG.UTF-8", "fa_IR", "he_IL", "ur_PK", "ps_AF", "ug_CN", "yi_US",
                             "dv_MV", "pa_PK", "uz_AF", "az@arabic"})
        EXPECT_TRUE(DisplayLanguage(name).isRightToLeft()) << name;
}

TEST(DisplayLanguageDirection, IsLeftToRightInAllOthers) {
    for (const char* name : {"", "C", "en_US", "ko_KR.UTF-8", "ru_RU", "de_DE@euro", "hi_IN", "id_ID", "zh_CN", "pa_IN",
                             "uz_UZ", "ks_IN@devanagari", "ug_CN@latin", "xx_YY"})
        EXPECT_FALSE(DisplayLanguage(name).isRightToLeft()) << name;
}

/// A workstation on which only these locales exist, besides the one that every Debian has.
struct Workstation {
    const char* what;
    std::vector<std::string> locales;
    const char* koreanLocale;
};

void PrintTo(const Workstation& workstation, std::ostream* out) {
    *out << workstation.what;
}

class DisplayLanguageOn : public testing::TestWithParam<Workstation> {
protected:
    DisplayLanguageOn() {
        fs::create_directory_symlink("/usr/lib/locale/C.utf8", folder_.path() / "C.utf8");
        for (const std::string& locale : GetParam().locales)
            fs::create_directory_symlink(fs::path(TEST_LOCALES) / locale, folder_.path() / locale);
        DisplayLanguage::bindTexts("drinks", TEST_TEXTS);
    }
    ~DisplayLanguageOn() override { setlocale(LC_ALL, "C"); }

    static std::string tea() { return dgettext("drinks", "IDS_TEA"); }

    support::TemporaryFolder folder_;
    support::Environment locales_{"LOCPATH", folder_.path().string()};
    support::Environment all_{"LC_ALL", "C"};
    support::Environment language_{"LANGUAGE", std::nullopt};
};

TEST_P(DisplayLanguageOn, GivesItsTextsAsUtf8) {
    DisplayLanguage("ko_KR").use();
    EXPECT_EQ("차", tea());
    EXPECT_STREQ("UTF-8", nl_langinfo(CODESET));
}

TEST_P(DisplayLanguageOn, ChangesTheTextsThatWereAskedForBefore) {
    DisplayLanguage("ko_KR").use();
    ASSERT_EQ("차", tea());
    DisplayLanguage("ru_RU").use();
    EXPECT_EQ("Чай", tea());
    DisplayLanguage("de_DE").use();
    EXPECT_EQ("IDS_TEA", tea());
    DisplayLanguage("ko_KR").use();
    EXPECT_EQ("차", tea());
    DisplayLanguage("C").use();
    EXPECT_EQ("IDS_TEA", tea());
}

TEST_P(DisplayLanguageOn, SetsALocaleThatTranslates) {
    DisplayLanguage("ko_KR").use();
    EXPECT_STREQ(GetParam().koreanLocale, setlocale(LC_MESSAGES, nullptr));
    EXPECT_EQ(GetParam().koreanLocale, DisplayLanguage("ko_KR.EUC-KR").locale());
    DisplayLanguage("").use();
    EXPECT_STREQ("C.UTF-8", setlocale(LC_MESSAGES, nullptr));
}

INSTANTIATE_TEST_SUITE_P(Workstations, DisplayLanguageOn,
                         testing::Values(Workstation{"WithoutAnyOtherLocale", {}, "C.UTF-8"},
                                         Workstation{"WithTheLanguagesLocale", {"ko_KR.UTF-8"}, "ko_KR.UTF-8"},
                                         Workstation{"WithTheLanguageInAnotherCharacterSet", {"ko_KR"}, "C.UTF-8"},
                                         Workstation{"WithTheLanguageInBoth", {"ko_KR", "ko_KR.UTF-8"}, "ko_KR.UTF-8"}),
                         [](const auto& workstation) { return std::string(workstation.param.what); });

}  // namespace
