#include "device/ApplicationLock.h"

#include "HeldApplicationLock.h"
#include "device/Folder.h"
#include "support/Message.h"
#include "support/TemporaryFolder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>

namespace {

using device::ApplicationLock;
using device::Folder;
using support::messageOf;

constexpr char app[] = "com.example.app";

class ApplicationLockTest : public testing::Test {
protected:
    support::TemporaryFolder place_;
    const Folder folder_{place_.path()};
};

}  // namespace

TEST_F(ApplicationLockTest, IsTakenByTheFirstProcess) {
    EXPECT_TRUE(ApplicationLock(folder_, app).isHeld());
    const HeldApplicationLock first(folder_, app);
    EXPECT_FALSE(ApplicationLock(folder_, app).isHeld());
    EXPECT_TRUE(ApplicationLock(folder_, "com.example.other").isHeld());
}

TEST_F(ApplicationLockTest, TellsWhoHasItUntilThatHasEnded) {
    EXPECT_EQ(ApplicationLock::holder(folder_, app), std::nullopt);
    {
        const HeldApplicationLock first(folder_, app);
        EXPECT_EQ(ApplicationLock::holder(folder_, app), first.process());
        EXPECT_EQ(ApplicationLock::holder(folder_, "com.example.other"), std::nullopt);
    }
    EXPECT_EQ(ApplicationLock::holder(folder_, app), std::nullopt);
}

TEST_F(ApplicationLockTest, IsNotSoughtInAPipe) {
    ASSERT_EQ(mkfifo(folder_.applicationLock(app).c_str(), 0600), 0);
    EXPECT_EQ(ApplicationLock::holder(folder_, app), std::nullopt);
}

TEST_F(ApplicationLockTest, NeedsAFolderThatCanBeWritten) {
    const Folder nowhere(place_.path() / "none");
    EXPECT_EQ(messageOf([&] { ApplicationLock(nowhere, app); }),
              nowhere.applicationLock(app).string() + ": No such file or directory; make the device's folder writable");
}

TEST_F(ApplicationLockTest, TellsWhichApplicationsHaveRun) {
    EXPECT_THAT(ApplicationLock::applications(folder_), testing::IsEmpty());
    for (const char* id : {"com.example.two", app, "com.example.one"})
        const ApplicationLock lock(folder_, id);
    for (const char* name : {"device.db.lock", "device.db", ".lock", "other.lock", "com.example.app.log"})
        support::writeFile(place_.path() / name, "");
    EXPECT_THAT(ApplicationLock::applications(folder_),
                testing::ElementsAre(app, "com.example.one", "com.example.two"));
    EXPECT_THAT(ApplicationLock::applications(Folder(place_.path() / "none")), testing::IsEmpty());
}
