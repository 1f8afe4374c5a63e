#include "device/ApplicationLock.h"

#include "device/Folder.h"
#include "support/Message.h"
#include "support/Process.h"
#include "support/TemporaryFolder.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

namespace {

using device::ApplicationLock;
using device::Folder;
using support::messageOf;

constexpr char app[] = "com.example.app";

/// A lock that another process holds while this lives.
class HeldElsewhere {
public:
    explicit HeldElsewhere(const Folder& folder)
        : process_(support::Process::ofWork([&] {
              const ApplicationLock lock(folder, app);
              [[maybe_unused]] const auto written = write(pipe_.writing, "!", 1);
              pause();
              return 0;
          })) {
        char byte = 0;
        [[maybe_unused]] const auto got = read(pipe_.reading, &byte, 1);
    }
    pid_t process() const { return process_.id(); }

private:
    struct Pipe {
        Pipe() {
            int ends[2];
            if (pipe(ends) != 0)
                throw std::runtime_error("no pipe");
            reading = ends[0];
            writing = ends[1];
        }
        ~Pipe() {
            close(reading);
            close(writing);
        }
        Pipe(const Pipe&) = delete;
        Pipe& operator=(const Pipe&) = delete;
        int reading;
        int writing;
    };
    Pipe pipe_;
    support::Process process_;
};

class ApplicationLockTest : public testing::Test {
protected:
    support::TemporaryFolder place_;
    const Folder folder_{place_.path()};
};

}  // namespace

TEST_F(ApplicationLockTest, IsTakenByTheFirstProcess) {
    EXPECT_TRUE(ApplicationLock(folder_, app).isHeld());
    const HeldElsewhere first(folder_);
    EXPECT_FALSE(ApplicationLock(folder_, app).isHeld());
    EXPECT_TRUE(ApplicationLock(folder_, "com.example.other").isHeld());
}

TEST_F(ApplicationLockTest, TellsWhoHasItUntilThatHasEnded) {
    EXPECT_EQ(ApplicationLock::holder(folder_, app), std::nullopt);
    {
        const HeldElsewhere first(folder_);
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
