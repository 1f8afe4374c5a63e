#include "Catalogue.h"
#include "Rules.h"
#include "Schema.h"
#include "support/TemporaryFolder.h"

#include <gmock/gmock.h>

namespace catalogue {
namespace {

using testing::IsEmpty;

const std::filesystem::path project = PROJECT_FOLDER;

/// The manual's example files, in the order in which it shows them: detail file, string file, main menu file.
std::vector<std::string> examples() {
    const std::string manual = support::readFile(project / "docs/catalogue.md");
    const std::string begin = "```xml\n";
    std::vector<std::string> found;
    for (std::size_t at = manual.find(begin); at != std::string::npos; at = manual.find(begin, at + 1)) {
        const std::size_t start = at + begin.size();
        found.push_back(manual.substr(start, manual.find("\n```", start) - start));
    }
    return found;
}

std::optional<std::string> none(const std::string&, const std::string&) {
    return std::nullopt;
}

TEST(Manual, ShowsValidFiles) {
    const std::vector<std::string> files = examples();
    ASSERT_EQ(3u, files.size());
    const std::filesystem::path schemas = project / "docs/schemas";
    EXPECT_THAT(schemaProblems(schemas / "kest_detail.rng", files[0], "detail file"), IsEmpty());
    EXPECT_THAT(schemaProblems(schemas / "kest_strings.rng", files[1], "string file"), IsEmpty());
    EXPECT_THAT(schemaProblems(schemas / "kest_menu.rng", files[2], "main menu file"), IsEmpty());
}

TEST(Manual, ShowsATipThatKeepsTheRules) {
    const std::vector<std::string> files = examples();
    ASSERT_EQ(3u, files.size());
    Tip tip;
    tip.detail = readDetail(files[0], "detail file");
    tip.strings = readStrings(files[1], "string file");
    EXPECT_THAT(contentsAreWellWritten(tip), IsEmpty());
    EXPECT_THAT(idsAreTranslated(tip, {"en_US"}, none), IsEmpty());
    EXPECT_THAT(translationsFitTheirPlace(tip, {"en_US"}, none), IsEmpty());
}

}  // namespace
}  // namespace catalogue
