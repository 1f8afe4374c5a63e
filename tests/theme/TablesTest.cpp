#include "Contract.h"
#include "Group.h"

#include "support/TemporaryDevice.h"
#include "ui/UiTest.h"
#include "ui_extension.h"

#include <gmock/gmock.h>

#include <regex>

namespace {

using namespace theme_test;
using testing::ElementsAreArray;
using testing::IsEmpty;
using testing::UnorderedElementsAreArray;

constexpr char colourTable[] = PROJECT "/res/table/com.ravella.kest_ChangeableColorInfo.xml";
constexpr char fontTable[] = PROJECT "/res/table/com.ravella.kest_ChangeableFontInfo.xml";

std::set<std::string> classesIn(const std::string& file) {
    const std::string text = support::readFile(file);
    const std::regex attribute("class=\"([^\"]+)\"");
    std::set<std::string> names;
    for (std::sregex_iterator match(text.begin(), text.end(), attribute), end; match != end; ++match)
        names.insert((*match)[1]);
    return names;
}

/// The application's tables, which a running application reads from its resources.
class ApplicationTables : public test_ui::UiTest {
protected:
    support::TemporaryDevice device_;
};

TEST_F(ApplicationTables, AreTables) {
    const auto colours = uxt_theme_add_color_table(colourTable);
    const auto fonts = uxt_theme_add_font_table(fontTable);
    EXPECT_NE(nullptr, colours);
    EXPECT_NE(nullptr, fonts);
    EXPECT_THAT(device_.logMessages(), IsEmpty());
    uxt_theme_delete_color_table(colours);
    uxt_theme_delete_font_table(fonts);
}

TEST_F(ApplicationTables, HoldTheClassesThatTheApplicationsGroupsUse) {
    std::set<std::string> colours;
    std::set<std::string> texts;
    for (const std::string& name : promisedGroups()) {
        if (!hasGroup(KEST_THEME, name))
            continue;
        const Group group = readGroup(screen().canvas(), KEST_THEME, name);
        colours.insert(group.colourClasses.begin(), group.colourClasses.end());
        texts.insert(group.textClasses.begin(), group.textClasses.end());
    }
    const auto devices = promisedNames("colour class");
    std::set<std::string> own = classesIn(colourTable);
    for (const std::string& name : devices)
        own.erase(name);
    EXPECT_THAT(own, ElementsAreArray(colours));
    EXPECT_THAT(classesIn(fontTable), ElementsAreArray(texts));
}

TEST_F(ApplicationTables, HoldTheColoursThatAreWrittenDown) {
    EXPECT_THAT(promisedNames("class in the table"), UnorderedElementsAreArray(classesIn(colourTable)));
}

}  // namespace
