#include "Rules.h"

#include <gmock/gmock.h>

namespace architecture {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/** The headers of the platform that the trees of these tests include. */
SourceTree treeWith(SourceFile file) {
    return {sourceFile("platform/app-assist/include/app-assist/WView.h", ""),
            sourceFile("platform/capi/include/vconf.h", ""),
            sourceFile("platform/device/include/device/Settings.h", ""),
            sourceFile("platform/efl-answers/include/efl-answers/DisplayLanguage.h", ""),
            sourceFile("platform/log-client/include/ravella-log-client.h", ""),
            sourceFile("platform/remote-control/include/remote-control/Server.h", ""),
            sourceFile("platform/ui-extension/include/ui_extension.h", ""),
            sourceFile("platform/ui-extension/include/uxt/Theme.h", ""),
            std::move(file)};
}

TEST(ApplicationIncludes, MayBeTheDevicesServicesEflLibxml2LibintlAndTheStandardLibrary) {
    EXPECT_THAT(
        applicationIncludesItsAllowedHeaders(treeWith(sourceFile("src/KestApp.cpp", "#include \"KestApp.h\"\n"
                                                                                    "#include <Elementary.h>\n"
                                                                                    "#include <app-assist/WView.h>\n"
                                                                                    "#include <libintl.h>\n"
                                                                                    "#include <libxml/parser.h>\n"
                                                                                    "#include <ravella-log-client.h>\n"
                                                                                    "#include <ui_extension.h>\n"
                                                                                    "#include <vconf.h>\n"
                                                                                    "#include <string.h>\n"
                                                                                    "#include <vector>\n"))),
        IsEmpty());
}

TEST(ApplicationIncludes, MayNotBeOfTheDevicesInside) {
    EXPECT_THAT(applicationIncludesItsAllowedHeaders(
                    treeWith(sourceFile("inc/KestApp.h", "#pragma once\n#include <device/Settings.h>\n"))),
                ElementsAre("inc/KestApp.h:2: includes device/Settings.h, which an application on a device does not "
                            "have"));
}

TEST(ApplicationIncludes, MayNotBeTheRemoteControl) {
    EXPECT_THAT(
        applicationIncludesItsAllowedHeaders(
            treeWith(sourceFile("src/KestApp.cpp", "#include \"remote-control/Server.h\"\n"))),
        ElementsAre("src/KestApp.cpp:1: includes remote-control/Server.h, which an application on a device does "
                    "not have"));
}

TEST(ApplicationIncludes, MayNotBeWhatThePlatformsLayersHaveForEachOther) {
    EXPECT_THAT(
        applicationIncludesItsAllowedHeaders(treeWith(
            sourceFile("src/KestApp.cpp", "#include <uxt/Theme.h>\n#include <efl-answers/DisplayLanguage.h>\n"))),
        ElementsAre("src/KestApp.cpp:1: includes uxt/Theme.h, which an application on a device does not have",
                    "src/KestApp.cpp:2: includes efl-answers/DisplayLanguage.h, which an application on a device "
                    "does not have"));
}

TEST(ApplicationIncludes, MayNotBeHeadersThatTheDevicesCompilerLacks) {
    EXPECT_THAT(
        applicationIncludesItsAllowedHeaders(treeWith(sourceFile("src/KestApp.cpp", "  # include <filesystem>\n"))),
        ElementsAre("src/KestApp.cpp:1: includes filesystem, which an application on a device does not have"));
}

TEST(ApplicationIncludes, MayNotBeOtherLibraries) {
    EXPECT_THAT(applicationIncludesItsAllowedHeaders(treeWith(sourceFile("src/KestApp.cpp", "#include <sqlite3.h>\n"))),
                ElementsAre("src/KestApp.cpp:1: includes sqlite3.h, which an application on a device does not have"));
}

TEST(ConditionalCode, MayGuardHeadersAndDefaultWhatTheBuildSets) {
    EXPECT_THAT(applicationHasNoConditionalCode({sourceFile("inc/KestPaths.h", "#ifndef KEST_APP_ROOT\n"
                                                                               "#define KEST_APP_ROOT \"/opt\"\n"
                                                                               "#endif\n")}),
                IsEmpty());
}

TEST(ConditionalCode, IsRefusedElsewhere) {
    EXPECT_THAT(
        applicationHasNoConditionalCode({sourceFile("src/KestApp.cpp", "#ifdef NDEBUG\n#else\n#endif\n"
                                                                       "#if defined(HAS_BUS)\n#endif\n"
                                                                       "#ifndef HAS_BUS\nint main();\n#endif\n")}),
        ElementsAre("src/KestApp.cpp:1: compiles differently in different places",
                    "src/KestApp.cpp:2: compiles differently in different places",
                    "src/KestApp.cpp:4: compiles differently in different places",
                    "src/KestApp.cpp:6: compiles differently in different places"));
}

TEST(WordsOfTheApplication, AreADevices) {
    EXPECT_THAT(applicationKnowsOfNoWorkstation({sourceFile("src/KestApp.cpp", "// The list of tips.\n"
                                                                               "int latest; // on the wrist\n")}),
                IsEmpty());
}

TEST(WordsOfTheApplication, AreNotAWorkstationsNorATests) {
    EXPECT_THAT(applicationKnowsOfNoWorkstation({sourceFile("src/KestApp.cpp", "// on a Workstation\n"
                                                                               "bool headless;\n"
                                                                               "// a test hook\n"
                                                                               "int benchmark_loops;\n")}),
                ElementsAre("src/KestApp.cpp:1: says \"Workstation\", which a device does not know",
                            "src/KestApp.cpp:2: says \"headless\", which a device does not know",
                            "src/KestApp.cpp:3: says \"test\", which a device does not know",
                            "src/KestApp.cpp:4: says \"benchmark\", which a device does not know"));
}

TEST(WordsOfTheApplication, AreADevicesInWhatBuildsItToo) {
    EXPECT_THAT(
        applicationKnowsOfNoWorkstation({sourceFile("src/CMakeLists.txt", "# Tests and benchmarks link it.\n")}),
        ElementsAre("src/CMakeLists.txt:1: says \"Tests\", which a device does not know"));
}

TEST(FixedPaths, StandInTheHeaderOfPaths) {
    EXPECT_THAT(fixedPathsStandInOneHeader({sourceFile("inc/KestPaths.h", "\"/opt/usr/apps/com.ravella.kest\"\n")}),
                IsEmpty());
}

TEST(FixedPaths, StandNowhereElse) {
    EXPECT_THAT(
        fixedPathsStandInOneHeader({sourceFile("src/KestApp.cpp", "\n\"/opt/usr/apps/com.ravella.kest/res\"\n"
                                                                  "bindtextdomain(domain, \"/usr/share/locale\");\n")}),
        ElementsAre("src/KestApp.cpp:2: has a fixed path of the device; inc/KestPaths.h is its place",
                    "src/KestApp.cpp:3: has a fixed path of the device; inc/KestPaths.h is its place"));
}

TEST(FixedPaths, AreNotThePathsWithinOtherThings) {
    EXPECT_THAT(fixedPathsStandInOneHeader({sourceFile(
                    "src/KestApp.cpp", "\"content://device/log/use\"; \"contents/opt/\"; name = path + \"/\";\n")}),
                IsEmpty());
}

TEST(WordsOfThePlatform, MayNameTheVariableOfTheDevicesFolder) {
    EXPECT_THAT(platformKnowsNoApplication({sourceFile("platform/device/src/Folder.cpp", "getenv(\"KEST_DEVICE\");\n"
                                                                                         "// a tooltip, multiple\n")}),
                IsEmpty());
}

TEST(WordsOfThePlatform, NameNoApplicationAndNoTip) {
    EXPECT_THAT(platformKnowsNoApplication({sourceFile("platform/capi/src/dlog.cpp", "const char* tag = \"KEST\";\n"
                                                                                     "// KEST_DEVICE and kest.edj\n"
                                                                                     "// one tip a page\n")}),
                ElementsAre("platform/capi/src/dlog.cpp:1: says \"KEST\"; the platform knows no application",
                            "platform/capi/src/dlog.cpp:2: says \"kest\"; the platform knows no application",
                            "platform/capi/src/dlog.cpp:3: says \"tip\"; the platform knows no application"));
}

TEST(WordsOfThePlatform, AreCheckedInThemesAndTextsToo) {
    EXPECT_THAT(platformKnowsNoApplication({sourceFile("platform/theme/device.edc", "group { name: \"kest/list\"; }\n"),
                                            sourceFile("platform/locale/ko/LC_MESSAGES/sys_string.po", "# Kest\n")}),
                ElementsAre("platform/theme/device.edc:1: says \"kest\"; the platform knows no application",
                            "platform/locale/ko/LC_MESSAGES/sys_string.po:1: says \"Kest\"; the platform knows no "
                            "application"));
}

TEST(Layers, MayIncludeWhatIsBeneath) {
    EXPECT_THAT(
        layersPointDown(treeWith(sourceFile("platform/app-assist/src/WApp.cpp", "#include \"app-assist/WView.h\"\n"
                                                                                "#include \"WViewPrivate.h\"\n"
                                                                                "#include <Elementary.h>\n"
                                                                                "#include <device/Settings.h>\n"
                                                                                "#include <remote-control/Server.h>\n"
                                                                                "#include <ui_extension.h>\n"
                                                                                "#include <vconf.h>\n"))),
        IsEmpty());
}

TEST(Layers, DeviceIncludesNoServiceAndNoWidget) {
    EXPECT_THAT(layersPointDown(treeWith(sourceFile("platform/device/src/Settings.cpp", "#include <vconf.h>\n"
                                                                                        "#include <Elementary.h>\n"
                                                                                        "#include <Ecore_Evas.h>\n"))),
                ElementsAre("platform/device/src/Settings.cpp:1: device includes vconf.h of capi, which is not beneath "
                            "it",
                            "platform/device/src/Settings.cpp:2: device includes Elementary.h, and has no widgets",
                            "platform/device/src/Settings.cpp:3: device includes Ecore_Evas.h, and has no widgets"));
}

TEST(Layers, ServicesIncludeNoWidgetAndNothingAbove) {
    EXPECT_THAT(
        layersPointDown(treeWith(sourceFile("platform/capi/src/vconf.cpp", "#include <Evas.h>\n"
                                                                           "#include <app-assist/WView.h>\n"
                                                                           "#include <ravella-log-client.h>\n"))),
        ElementsAre("platform/capi/src/vconf.cpp:1: capi includes Evas.h, and has no widgets",
                    "platform/capi/src/vconf.cpp:2: capi includes app-assist/WView.h of app-assist, which is "
                    "not beneath it",
                    "platform/capi/src/vconf.cpp:3: capi includes ravella-log-client.h of log-client, which is "
                    "not beneath it"));
}

TEST(Layers, OfOneHeightDoNotIncludeEachOther) {
    EXPECT_THAT(layersPointDown(treeWith(
                    sourceFile("platform/ui-extension/src/colours.cpp", "#include <remote-control/Server.h>\n"))),
                ElementsAre("platform/ui-extension/src/colours.cpp:1: ui-extension includes remote-control/Server.h of "
                            "remote-control, which is not beneath it"));
}

TEST(Layers, AreNotReachedPastTheIncludeFolders) {
    EXPECT_THAT(layersPointDown(treeWith(sourceFile("platform/device/src/Bus.cpp", "#include \"../../capi/x.h\"\n"))),
                ElementsAre("platform/device/src/Bus.cpp:1: includes ../../capi/x.h past the include folders"));
}

TEST(Layers, AreAllNamedByTheRule) {
    EXPECT_THAT(layersPointDown(treeWith(sourceFile("platform/extra/src/Extra.cpp", "#include <vector>\n"))),
                ElementsAre("platform/extra/src/Extra.cpp:1: extra is a layer that the rule about layers does not "
                            "name"));
}

TEST(Files, MayHave320Lines) {
    EXPECT_THAT(filesHaveOneJob({sourceFile("src/KestApp.cpp", std::string(320, '\n'))}), IsEmpty());
}

TEST(Files, MayNotHaveMore) {
    EXPECT_THAT(filesHaveOneJob({sourceFile("tools/kest-device/main.cpp", std::string(321, '\n'))}),
                ElementsAre("tools/kest-device/main.cpp: has 321 lines; it has more than one job above 320"));
}

}  // namespace
}  // namespace architecture
