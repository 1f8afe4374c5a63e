#include "device/Device.h"

#include "device/Error.h"
#include "device/Keys.h"
#include "support/Environment.h"
#include "support/Message.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using device::Device;
using device::Screen;
using support::Environment;
using support::messageOf;
using support::TemporaryDevice;
using support::TemporaryFolder;
using support::writeFile;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::MatchesRegex;

TEST(Device, TellsTheLanguageWithoutItsCodeset) {
    const TemporaryDevice device;
    EXPECT_EQ(device->language(), "en_US");
    for (const auto& [setting, language] :
         {std::pair("ko_KR.UTF-8", "ko_KR"), std::pair("sr_RS@latin", "sr_RS@latin"),
          std::pair("ca_ES.UTF-8@valencia", "ca_ES@valencia"), std::pair("de", "de")}) {
        device->settings().set(device::keys::language, setting);
        EXPECT_EQ(device->language(), language);
    }
    device->settings().remove(device::keys::language);
    EXPECT_EQ(device->language(), "en_US");
}

TEST(Device, ListsTheLanguagesOfItsOwnTexts) {
    const TemporaryDevice device;
    EXPECT_THAT(device->languages(), IsEmpty());
    writeFile(device.data() / "locale/ru_RU/LC_MESSAGES/sys_string.mo", "");
    writeFile(device.data() / "locale/en_US/LC_MESSAGES/sys_string.mo", "");
    writeFile(device.data() / "locale/de_DE/LC_MESSAGES/other.mo", "");
    EXPECT_THAT(device->languages(), ElementsAre("en_US", "ru_RU"));
}

TEST(Device, HasTheScreenOfItsSetting) {
    TemporaryDevice device;
    EXPECT_EQ(device->screen().name, "720x1280");
    EXPECT_EQ(device->screen().scale, 2.6);
    EXPECT_EQ(device->screen().resourceFolder, "");
    device->settings().set(device::keys::screen, "480x800");
    device.reopen();
    EXPECT_EQ(device->screen().width, 480);
    EXPECT_EQ(device->screen().height, 800);
    EXPECT_EQ(device->screen().scale, 1.7);
    EXPECT_EQ(device->screen().resourceFolder, "LDPI");
    device->settings().set(device::keys::screen, "nonsense");
    device.reopen();
    EXPECT_EQ(device->screen().name, "720x1280");
}

TEST(Device, KeepsItsScreenUntilItIsOpenedAnew) {
    TemporaryDevice device;
    EXPECT_EQ(device->screen().name, "720x1280");
    device->settings().set(device::keys::screen, "480x800");
    EXPECT_EQ(device->screen().name, "720x1280");
}

TEST(Device, KnowsTheProfilesOfItsKind) {
    std::vector<std::string> names;
    for (const Screen& screen : Screen::all())
        names.push_back(screen.name);
    EXPECT_THAT(names, ElementsAre("720x1280", "480x800"));
}

TEST(Device, SaysWhyThisProcessIsNoApplication) {
    const TemporaryFolder folder;
    Device device({device::Folder(folder.path()), {}, folder.path()});
    const std::filesystem::path package = std::filesystem::read_symlink("/proc/self/exe").parent_path().parent_path();
    EXPECT_EQ(messageOf([&] { device.application(); }),
              (package / "tizen-manifest.xml").string() +
                  ": cannot be read: No such file or directory; a package has a tizen-manifest.xml in its folder");
}

/// A device as a process finds it in its environment.
class CurrentDevice : public testing::Test {
protected:
    CurrentDevice() { Device::setCurrent(nullptr); }
    ~CurrentDevice() override { Device::setCurrent(nullptr); }
    TemporaryFolder there;
    Environment named{"KEST_DEVICE", (there.path() / "device").string()};
};

TEST_F(CurrentDevice, IsOpenedAtTheFirstCallAndStays) {
    Device& device = Device::current();
    EXPECT_EQ(device.folder().root(), there.path() / "device");
    EXPECT_EQ(&Device::current(), &device);
    EXPECT_TRUE(std::filesystem::exists(there.path() / "device/device.db"));
}

TEST_F(CurrentDevice, ReplacesADamagedDatabaseAndSaysSo) {
    writeFile(there.path() / "device/device.db", std::string(10000, 'x'));
    testing::internal::CaptureStderr();
    EXPECT_EQ(Device::current().settings().get(device::keys::theme), "light");
    const std::string file = (there.path() / "device/device.db").string();
    EXPECT_THAT(testing::internal::GetCapturedStderr(),
                MatchesRegex(file + ": is damaged \\(file is not a database\\); it was renamed to " + file +
                             "\\.damaged-[0-9]+T[0-9]+Z and the device begins with a fresh database; `sqlite3 " + file +
                             "\\.damaged-[0-9]+T[0-9]+Z \\.recover` prints what can be saved of the old one\n"));
}

TEST_F(CurrentDevice, SaysWhyItCannotBeOpened) {
    writeFile(there.path() / "device", "");
    EXPECT_EQ(messageOf([] { Device::current(); }),
              (there.path() / "device").string() +
                  ": the device's folder cannot be made: a file stands in its place; give the device another folder "
                  "with KEST_DEVICE, or make this one writable");
}

}  // namespace
