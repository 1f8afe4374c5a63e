#include "device/BusCall.h"

#include "device/Bus.h"
#include "support/BusClient.h"
#include "support/Message.h"
#include "support/PrivateBus.h"
#include "support/TemporaryFolder.h"

#include <gtest/gtest.h>

namespace {

constexpr char name[] = "com.example.app";

/// A bus that starts a program for a name: it leaves a file.
class BusThatStarts : public testing::Test {
protected:
    BusThatStarts() {
        const std::filesystem::path program = folder_.path() / "program";
        support::writeFile(program, "#!/bin/sh\n: > '" + trace().string() + "'\nexit 1\n");
        std::filesystem::permissions(program, std::filesystem::perms::owner_all);
        support::writeFile(folder_.path() / "services" / (std::string(name) + ".service"),
                           "[D-BUS Service]\nName=" + std::string(name) + "\nExec=" + program.string() + "\n");
        daemon_.emplace(true, "EXTERNAL", (folder_.path() / "services").string());
    }
    std::filesystem::path trace() const { return folder_.path() / "was-started"; }

    support::TemporaryFolder folder_;
    std::optional<support::PrivateBus> daemon_;
};

TEST_F(BusThatStarts, StartsNobodyForACallToWhoeverRuns) {
    const auto bus = device::Bus::connect(device::Folder(folder_.path() / "device"));
    ASSERT_TRUE(bus);
    const device::BusCall application(*bus, name, device::bus::pathOf(name), device::bus::applicationInterface);

    EXPECT_EQ(support::messageOf([&] { application.call("Quit"); }), "com.example.app is not running");
    EXPECT_EQ(support::messageOf([&] { application.property("Folder"); }), "com.example.app is not running");
    EXPECT_FALSE(std::filesystem::exists(trace()));

    support::BusClient other(daemon_->address());
    EXPECT_NE(other.call({name, "/com/example/app", device::bus::applicationInterface}, "Quit", {}, true), "");
    EXPECT_TRUE(std::filesystem::exists(trace())) << "the bus would have";
}

}  // namespace
