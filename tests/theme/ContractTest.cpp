#include "Contract.h"
#include "Group.h"

#include "support/TemporaryFolder.h"
#include "ui/UiTest.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <regex>

namespace {

using namespace theme_test;
using testing::Contains;
using testing::IsEmpty;
using testing::IsSupersetOf;
using testing::Not;

std::string fileOf(const std::string& group) {
    return group.rfind("elm/", 0) == 0 ? DEVICE_THEME : KEST_THEME;
}

class Contract : public test_ui::UiTest {};

TEST_F(Contract, EveryGroupIsThere) {
    const auto groups = promisedGroups();
    ASSERT_THAT(groups, Not(IsEmpty()));
    for (const std::string& group : groups)
        EXPECT_TRUE(hasGroup(fileOf(group), group)) << group;
}

TEST_F(Contract, EveryGroupOfTheFilesIsWrittenDown) {
    for (const char* file : {DEVICE_THEME, KEST_THEME}) {
        Eina_List* groups = edje_file_collection_list(file);
        const Eina_List* node = nullptr;
        void* each = nullptr;
        EINA_LIST_FOREACH(groups, node, each)
        EXPECT_THAT(promisedGroups(), Contains(static_cast<const char*>(each)));
        edje_file_collection_list_free(groups);
    }
}

TEST_F(Contract, EveryPartSignalAndDataItemIsThere) {
    const auto all = promises();
    ASSERT_THAT(all, Not(IsEmpty()));
    for (const Promise& promise : all) {
        SCOPED_TRACE(promise.group + ": " + promise.kind + " " + promise.name);
        const std::string file = fileOf(promise.group);
        ASSERT_TRUE(hasGroup(file, promise.group));
        const Group group = readGroup(screen().canvas(), file, promise.group);
        if (promise.kind == "part")
            EXPECT_THAT(group.parts, Contains(promise.name));
        else if (promise.kind == "in")
            EXPECT_THAT(group.signalsIn, Contains("elm: " + promise.name));
        else if (promise.kind == "in \"\"")
            EXPECT_THAT(group.signalsIn, Contains(": " + promise.name));
        else if (promise.kind == "out")
            EXPECT_THAT(group.signalsOut, Contains("elm: " + promise.name));
        else
            EXPECT_EQ(promise.value, dataItem(screen().canvas(), file, promise.group, promise.name));
    }
}

TEST_F(Contract, EverySignalThatAGroupSendsOrHearsIsWrittenDown) {
    const auto all = promises();
    const auto isPromised = [&](const std::string& group, const std::string& kind, const std::string& signal) {
        return std::any_of(all.begin(), all.end(), [&](const Promise& promise) {
            const std::string source = promise.kind == "in \"\"" ? ": " : "elm: ";
            return promise.group == group && promise.kind.rfind(kind, 0) == 0 && source + promise.name == signal;
        });
    };
    for (const std::string& name : promisedGroups()) {
        const Group group = readGroup(screen().canvas(), fileOf(name), name);
        for (const std::string& signal : group.signalsIn) {
            const bool isFromOutside = signal.rfind("elm: ", 0) == 0 || signal.rfind(": ", 0) == 0;
            EXPECT_TRUE(!isFromOutside || isPromised(name, "in", signal)) << name << " hears " << signal;
        }
        for (const std::string& signal : group.signalsOut)
            EXPECT_TRUE(isPromised(name, "out", signal)) << name << " sends " << signal;
    }
}

/// What the application's code calls groups, parts and signals: by its form, or by where it stands.
TEST_F(Contract, EveryNameInTheApplicationsCodeIsWrittenDown) {
    std::set<std::string> known;
    for (const Promise& promise : promises())
        known.insert(promise.name);
    for (const std::string& group : promisedGroups())
        known.insert(group);
    const std::regex literal(
        R"re("((?:elm\.|kest/|layout/|reply,|touch,)[A-Za-z0-9_./,]+)")re"
        R"re(|(?:part_content_[gs]et|part_text_set|signal_emit|\bput)\([^;"]*"([^"]+)"|Part\[\] = "([^"]+)")re");
    std::set<std::string> found;
    for (const auto& entry : std::filesystem::directory_iterator(PROJECT "/src")) {
        if (entry.path().extension() != ".cpp")
            continue;
        const std::string text = support::readFile(entry.path());
        for (std::sregex_iterator match(text.begin(), text.end(), literal), end; match != end; ++match) {
            const std::string name = (*match)[1].str() + (*match)[2].str() + (*match)[3].str();
            EXPECT_THAT(known, Contains(name)) << "named in " << entry.path().filename();
            found.insert(name);
        }
    }
    EXPECT_THAT(found, IsSupersetOf({"kest/content/main", "reply,pressed", "touch,hide", "video", "info", "entry",
                                     "title.area", "scroller", "page", "page.touch", "sizer", "show"}));
}

TEST_F(Contract, TheDevicesClassesAreTheOnesThatAreWrittenDown) {
    std::set<std::string> colours;
    std::set<std::string> texts;
    for (const std::string& name : promisedGroups()) {
        if (fileOf(name) != DEVICE_THEME)
            continue;
        const Group group = readGroup(screen().canvas(), DEVICE_THEME, name);
        colours.insert(group.colourClasses.begin(), group.colourClasses.end());
        texts.insert(group.textClasses.begin(), group.textClasses.end());
    }
    EXPECT_THAT(promisedNames("colour class"), testing::UnorderedElementsAreArray(colours));
    EXPECT_THAT(promisedNames("text class"), testing::UnorderedElementsAreArray(texts));
}

}  // namespace
