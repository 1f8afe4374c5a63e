#include "device/Application.h"

#include "support/Process.h"
#include "support/TemporaryDevice.h"

#include <gtest/gtest.h>

namespace {

using support::Process;

// A copy of this program, laid out as a package, runs this same test with the package in its environment.
constexpr char expectedRoot[] = "DEVICE_TEST_PACKAGE";

TEST(Application, InAPackageKnowsItsIdAndFolder) {
    const char* root = std::getenv(expectedRoot);
    if (!root) {
        const support::TemporaryFolder there;
        const auto package = support::TemporaryDevice::makePackage(there.path() / "package", "com.example.own");
        std::filesystem::create_directory(package / "bin");
        std::filesystem::copy_file("/proc/self/exe", package / "bin/app");
        auto copy = Process::ofWork([&] {
            setenv(expectedRoot, package.c_str(), 1);
            const std::string program = (package / "bin/app").string();
            execl(program.c_str(), program.c_str(), "--gtest_filter=Application.InAPackageKnowsItsIdAndFolder",
                  "--gtest_brief=1", nullptr);
            return 127;
        });
        EXPECT_EQ(copy.wait(), 0);
        return;
    }
    const device::Application application = device::Application::ofThisProcess();
    EXPECT_EQ(application.id, "com.example.own");
    EXPECT_EQ(application.root, root);
}

}  // namespace
