#include "support/TemporaryFolder.h"

#include <filesystem>
#include <gmock/gmock.h>
#include <string>
#include <vector>

namespace {

namespace fs = std::filesystem;
using testing::IsEmpty;

const fs::path project = PROJECT_FOLDER;
const fs::path root = fs::path(KEST_PROGRAM).parent_path().parent_path();

/// The files below `from` that are not below `to`, or are other ones there.
std::vector<std::string> missing(const fs::path& from, const fs::path& to) {
    std::vector<std::string> found;
    int files = 0;
    for (const fs::directory_entry& entry : fs::recursive_directory_iterator(from)) {
        if (!entry.is_regular_file())
            continue;
        ++files;
        const fs::path staged = to / entry.path().lexically_relative(from);
        if (!fs::exists(staged) || support::readFile(staged) != support::readFile(entry.path()))
            found.push_back(staged);
    }
    EXPECT_GT(files, 0) << from;
    return found;
}

}  // namespace

/// What the build puts beside the program is all that the application reads.
TEST(StagedApplication, HasTheWholeCatalogue) {
    EXPECT_THAT(missing(project / "shared/res", root / "shared/res"), IsEmpty());
}

TEST(StagedApplication, HasItsPicturesAndTables) {
    for (const char* folder : {"images", "table"})
        EXPECT_THAT(missing(project / "res" / folder, root / "res" / folder), IsEmpty());
}

TEST(StagedApplication, HasTheTablesOfALowDensityDisplayByWhichItTellsOne) {
    EXPECT_THAT(missing(project / "res/table", root / "res/LDPI/table"), IsEmpty());
}

TEST(StagedApplication, HasItsThemeAndItsTextsInEveryLanguage) {
    EXPECT_TRUE(fs::is_regular_file(root / "res/edje/kest.edj"));
    for (const fs::directory_entry& language : fs::directory_iterator(project / "res/locale"))
        EXPECT_TRUE(fs::is_regular_file(root / "res/locale" / language.path().filename() / "LC_MESSAGES/kest.mo"))
            << language.path();
}
