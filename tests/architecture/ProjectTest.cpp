#include "Rules.h"

#include <gmock/gmock.h>

namespace architecture {
namespace {

using testing::IsEmpty;

const SourceTree& project() {
    static const SourceTree tree = readTree(PROJECT_FOLDER, {"src", "inc", "platform", "tools", "tests", "bench"});
    return tree;
}

TEST(Project, ApplicationIncludesItsAllowedHeaders) {
    EXPECT_THAT(applicationIncludesItsAllowedHeaders(project()), IsEmpty());
}

TEST(Project, ApplicationHasNoConditionalCode) {
    EXPECT_THAT(applicationHasNoConditionalCode(project()), IsEmpty());
}

TEST(Project, ApplicationKnowsOfNoWorkstation) {
    EXPECT_THAT(applicationKnowsOfNoWorkstation(project()), IsEmpty());
}

TEST(Project, FixedPathsStandInOneHeader) {
    EXPECT_THAT(fixedPathsStandInOneHeader(project()), IsEmpty());
}

TEST(Project, PlatformKnowsNoApplication) {
    EXPECT_THAT(platformKnowsNoApplication(project()), IsEmpty());
}

TEST(Project, LayersPointDown) {
    EXPECT_THAT(layersPointDown(project()), IsEmpty());
}

TEST(Project, FilesHaveOneJob) {
    EXPECT_THAT(filesHaveOneJob(project()), IsEmpty());
}

TEST(Project, IsReadWhole) {
    std::vector<std::string> paths;
    for (const SourceFile& file : project()) {
        paths.push_back(file.path);
    }
    EXPECT_THAT(paths,
                testing::IsSupersetOf({"src/main.cpp", "src/CMakeLists.txt", "inc/KestPaths.h",
                                       "platform/device/CMakeLists.txt", "platform/device/include/device/Device.h",
                                       "platform/theme/device.edc", "tools/kest-device/main.cpp",
                                       "tests/architecture/ProjectTest.cpp", "bench/CMakeLists.txt"}));
}

}  // namespace
}  // namespace architecture
