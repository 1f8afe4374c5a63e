#include "Catalogue.h"
#include "Pictures.h"
#include "Rules.h"
#include "Schema.h"
#include "Texts.h"
#include "Xml.h"
#include "support/TemporaryFolder.h"

#include <algorithm>
#include <arpa/inet.h>
#include <cstring>
#include <gmock/gmock.h>
#include <libxml/tree.h>
#include <set>

namespace catalogue {
namespace {

namespace fs = std::filesystem;
using testing::ElementsAre;
using testing::IsEmpty;

const fs::path project = PROJECT_FOLDER;

/// What a rule says of every tip that ships.
template <typename Rule>
Problems everyTip(const Rule& rule) {
    Problems problems;
    for (const Tip& tip : readCatalogue(project)) {
        for (const std::string& problem : rule(tip))
            problems.push_back(problem);
    }
    return problems;
}

/// Every file of the catalogue's folders, wherever an application brings one.
std::vector<fs::path> catalogueFiles() {
    std::vector<fs::path> folders = {project / "shared/res/contents"};
    for (const auto& [id, root] : packages(project)) {
        if (fs::exists(root / "shared/res/contents"))
            folders.push_back(root / "shared/res/contents");
    }
    std::vector<fs::path> files;
    for (const fs::path& folder : folders) {
        for (const fs::directory_entry& entry : fs::recursive_directory_iterator(folder)) {
            if (entry.path().extension() == ".xml")
                files.push_back(entry.path());
        }
    }
    return files;
}

const char* schemaOf(const fs::path& file) {
    if (file.filename() == "kest_menu.xml")
        return "kest_menu.rng";
    return file.stem().string().ends_with("-string") ? "kest_strings.rng" : "kest_detail.rng";
}

struct Size {
    unsigned width = 0;
    unsigned height = 0;
    bool operator==(const Size&) const = default;
};

/// 0x0 for what is no PNG.
Size sizeOf(const fs::path& picture) {
    const std::string bytes = support::readFile(picture).substr(0, 24);
    if (bytes.size() < 24 || bytes.compare(1, 3, "PNG") != 0)
        return {};
    std::uint32_t sides[2];
    std::memcpy(sides, bytes.data() + 16, sizeof(sides));
    return {ntohl(sides[0]), ntohl(sides[1])};
}

TEST(ShippedCatalogue, IsValid) {
    Problems problems;
    for (const fs::path& file : catalogueFiles()) {
        for (const std::string& problem : schemaProblems(project / "docs/schemas" / schemaOf(file),
                                                         support::readFile(file), fs::relative(file, project)))
            problems.push_back(problem);
    }
    EXPECT_THAT(problems, IsEmpty());
}

TEST(ShippedCatalogue, HasNoFileThatNoMenuNames) {
    std::set<fs::path> named = {project / "shared/res/contents/kest_menu.xml"};
    for (const Tip& tip : readCatalogue(project)) {
        named.insert(tip.sharedResources / tip.path);
        named.insert(project / tip.strings.file);
    }
    const std::vector<fs::path> files = catalogueFiles();
    EXPECT_EQ(named, std::set<fs::path>(files.begin(), files.end()));
}

TEST(ShippedCatalogue, HasWellWrittenContents) {
    EXPECT_THAT(everyTip(contentsAreWellWritten), IsEmpty());
}

TEST(ShippedCatalogue, IsTranslated) {
    EXPECT_THAT(everyTip([](const Tip& tip) { return idsAreTranslated(tip, languagesIn(DEVICE_TEXTS), sharedText); }),
                IsEmpty());
}

TEST(ShippedCatalogue, HasTranslationsInTheirLanguage) {
    EXPECT_THAT(everyTip(translationsHaveLettersOfTheirLanguage), IsEmpty());
}

TEST(ShippedCatalogue, HasTranslationsThatFitTheirPlace) {
    EXPECT_THAT(
        everyTip([](const Tip& tip) { return translationsFitTheirPlace(tip, languagesIn(DEVICE_TEXTS), sharedText); }),
        IsEmpty());
}

TEST(ShippedCatalogue, NamesFilesThatExist) {
    EXPECT_THAT(everyTip(filesExist), IsEmpty());
}

TEST(ShippedCatalogue, HasUniquePaths) {
    EXPECT_THAT(pathsAreUnique(readCatalogue(project)), IsEmpty());
}

TEST(ShippedCatalogue, HasStringsThatAgree) {
    EXPECT_THAT(stringsAgree(readCatalogue(project)), IsEmpty());
}

TEST(ShippedCatalogue, FitsThePagerInEveryRegion) {
    EXPECT_THAT(regionsAreNotTooFull(readCatalogue(project)), IsEmpty());
}

TEST(ShippedCatalogue, OffersTipsInEveryRegion) {
    const std::vector<Tip> tips = readCatalogue(project);
    for (const char* region : {"Global", "India", "Russia", "Indonesia", "SWA", "Africa"})
        EXPECT_GE(tipsIn(region, tips), 10u) << region;
    const auto onlyIn = [&](const std::string& region) {
        return std::count_if(tips.begin(), tips.end(), [&](const Tip& tip) { return tip.state == region; });
    };
    EXPECT_GE(onlyIn("India"), 1);
    EXPECT_GE(onlyIn("Russia"), 1);
    EXPECT_GE(onlyIn("Global"), 1);
}

TEST(ShippedCatalogue, HasOneTipThatWaitsForItsApplication) {
    std::vector<std::string> waiting;
    for (const Tip& tip : readCatalogue(project)) {
        if (!tip.everywhere)
            waiting.push_back(tip.appid);
    }
    EXPECT_THAT(waiting, ElementsAre("com.ravella.sleep"));
}

TEST(ShippedCatalogue, IsAboutApplicationsThatShip) {
    std::map<std::string, fs::path> known = packages(project);
    known["com.ravella.kest"] = project;
    for (const Tip& tip : readCatalogue(project)) {
        EXPECT_TRUE(known.count(tip.appid)) << tip.detail.file << ": " << tip.appid;
        EXPECT_TRUE(tip.detail.launchAppid.text.empty() || known.count(tip.detail.launchAppid.text))
            << tip.detail.file << ": " << tip.detail.launchAppid.text;
    }
}

TEST(ShippedPackages, HaveAManifestAndAnIcon) {
    for (const auto& [id, root] : packages(project)) {
        const Document manifest = readDocument(root / "tizen-manifest.xml");
        const xmlNode* package = xmlDocGetRootElement(manifest.get());
        const xmlNode* application = childNamed(package, "ui-application");
        EXPECT_EQ(id, attributeOf(package, "package"));
        EXPECT_EQ(id, attributeOf(application, "appid"));
        EXPECT_NE("", attributeOf(package, "version")) << id;
        EXPECT_NE("", textOf(childNamed(application, "label"))) << id;
        EXPECT_EQ((Size{196, 196}), sizeOf(root / "shared/res" / textOf(childNamed(application, "icon")))) << id;
    }
}

TEST(ShippedPictures, FitThePage) {
    EXPECT_THAT(everyTip(picturesFitThePage), IsEmpty());
}

TEST(ShippedPictures, BelongToTips) {
    EXPECT_THAT(picturesBelongToTips(readCatalogue(project)), IsEmpty());
}

TEST(ShippedPictures, AreOfEveryKindThatAPageShows) {
    std::set<std::string> kinds;
    for (const Tip& tip : readCatalogue(project)) {
        const Pictures pictures = picturesOf(tip);
        const std::size_t count = pictures.shown.size();
        const bool isTall = count == 1 && sizeOf(pictures.shown.begin()->second).height > 655;
        kinds.insert(isTall       ? "tall"
                     : count == 0 ? "placeholder"
                     : count == 1 ? "plain"
                     : count == 2 ? "two"
                     : count >= 5 ? "five or more"
                                  : "three or four");
        if (count > 1)
            kinds.insert(pictures.markers.empty() ? "without markers" : "with markers");
        if (!pictures.russian.empty() && pictures.russian.size() == count)
            kinds.insert("Russian");
    }
    EXPECT_THAT(kinds, ElementsAre("Russian", "five or more", "placeholder", "plain", "tall", "three or four", "two",
                                   "with markers", "without markers"));
}

TEST(ShippedPictures, HaveTheSizesOfTheirPlaces) {
    EXPECT_EQ((Size{196, 196}), sizeOf(project / "shared/res/kest.png"));
    EXPECT_EQ((Size{96, 96}), sizeOf(project / "res/images/noti_kest.png"));
    EXPECT_EQ((Size{716, 655}), sizeOf(project / "shared/res/contents/contents_not_released.png"));
}

}  // namespace
}  // namespace catalogue
