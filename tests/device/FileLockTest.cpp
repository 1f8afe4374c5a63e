#include "Files.h"

#include "device/Error.h"
#include "support/Message.h"
#include "support/TemporaryFolder.h"

#include <gtest/gtest.h>

#include <optional>

namespace {

using device::FileLock;
using support::messageOf;

class Lock : public testing::Test {
protected:
    support::TemporaryFolder folder;
    const std::filesystem::path file = folder.path() / "lock";
};

TEST_F(Lock, ThatAnotherHoldsIsGivenUpWithALine) {
    const FileLock held(file);
    EXPECT_EQ(file.string() + ": is held by another process; end that process and try again",
              messageOf([&] { FileLock(file, std::chrono::milliseconds(20)); }));
}

TEST_F(Lock, IsFreeOnceItsHolderHasGone) {
    std::optional<FileLock> held(file);
    held.reset();
    EXPECT_NO_THROW(FileLock(file, std::chrono::milliseconds(0)));
}

TEST_F(Lock, NeedsAFolderThatCanBeWritten) {
    const auto nowhere = folder.path() / "none/lock";
    EXPECT_EQ(nowhere.string() + ": cannot be made: No such file or directory; make its folder one that this user "
                                 "can write",
              messageOf([&] { FileLock{nowhere}; }));
}

}  // namespace
