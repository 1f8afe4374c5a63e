#include "notifier/NotificationAppearance.h"

#include "device/Keys.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

namespace fs = std::filesystem;

constexpr char png[] = "\x89PNG\r\n\x1a\n";

class Appearance : public testing::Test {
protected:
    Appearance() {
        fs::create_directories(device_.appRoot() / "res");
        fs::copy(TEST_TEXTS, device_.appRoot() / "res/locale", fs::copy_options::recursive);
        notification_.appId = device_.appId();
        notification_.title = {"Tea", "IDS_TEA"};
        notification_.content = {"It is ready.", "IDS_READY"};
    }
    NotificationAppearance seen() const { return NotificationAppearance::of(device_.device(), notification_); }
    void setLanguage(const std::string& language) const { device_->settings().set(device::keys::language, language); }
    /// A picture in the test's own folder.
    std::string picture(const std::string& name, const std::string& bytes = png) const {
        const fs::path file = device_.folder() / name;
        support::writeFile(file, bytes);
        return file.string();
    }

    support::TemporaryDevice device_;
    device::Notification notification_;
};

TEST_F(Appearance, HasTheTextsOfTheDevicesLanguage) {
    EXPECT_EQ(seen().title, "Tea");
    EXPECT_EQ(seen().content, "It is ready.");
    setLanguage("ko_KR.UTF-8");
    EXPECT_EQ(seen().title, "차");
    EXPECT_EQ(seen().content, "차가 <다> 되었습니다 & 기다립니다.");
    setLanguage("de_DE.UTF-8");
    EXPECT_EQ(seen().title, "Tea") << "there is no German catalogue";
}

TEST_F(Appearance, HasTheTextAsItWasGivenWhereItIsNotTranslated) {
    setLanguage("ko_KR.UTF-8");
    notification_.title.id = "IDS_COFFEE";
    notification_.content.id = "";
    EXPECT_EQ(seen().title, "Tea");
    EXPECT_EQ(seen().content, "It is ready.");
    notification_.title = {"", "IDS_TEA"};
    EXPECT_EQ(seen().title, "차");
}

TEST_F(Appearance, StaysReadableWhenTheApplicationIsGoneOrBroken) {
    setLanguage("ko_KR.UTF-8");
    notification_.appId = "com.example.gone";
    EXPECT_EQ(seen().title, "Tea");
    EXPECT_EQ(seen().application, "com.example.gone");
    notification_.appId = device_.appId();
    support::writeFile(device_.appRoot() / "tizen-manifest.xml", "<manifest");
    EXPECT_EQ(seen().title, "차");
    EXPECT_EQ(seen().application, device_.appId());
    EXPECT_EQ(seen().icon, "");
}

TEST_F(Appearance, NamesTheApplication) {
    EXPECT_EQ(seen().application, "Label of com.example.app");
}

TEST_F(Appearance, IsUtf8InAnyCase) {
    notification_.title = {"caf\xe9", ""};
    EXPECT_EQ(seen().title, "caf\xEF\xBF\xBD");
}

TEST_F(Appearance, HasTheFirstIconThatThereIs) {
    notification_.icon = "/usr/icons/tea.png";
    notification_.indicatorIcon = picture("indicator.png");
    EXPECT_EQ(seen().icon, notification_.indicatorIcon);
    const fs::path own = device_.appRoot() / "shared/res/icon.png";
    support::writeFile(own, png);
    EXPECT_EQ(seen().icon, own.string()) << "seen on any ground, other than the white one of the indicator";
    support::writeFile(device_.root() / "usr/icons/tea.png", png);
    EXPECT_EQ(seen().icon, (device_.root() / "usr/icons/tea.png").string()) << "a path of the device";
    notification_.icon = picture("tea.png");
    EXPECT_EQ(seen().icon, notification_.icon) << "a path of its package";
}

TEST_F(Appearance, HasNoIconThatWouldNotShow) {
    EXPECT_EQ(seen().icon, "");
    notification_.indicatorIcon = picture("text.png", "no picture");
    EXPECT_EQ(seen().icon, "");
    notification_.indicatorIcon = picture("empty.png", "");
    EXPECT_EQ(seen().icon, "");
    fs::create_directories(device_.folder() / "folder.png");
    notification_.indicatorIcon = (device_.folder() / "folder.png").string();
    EXPECT_EQ(seen().icon, "");
    notification_.indicatorIcon = "indicator.png";
    EXPECT_EQ(seen().icon, "") << "a path that leads nowhere in particular";
    for (const std::string beginning : {"\xFF\xD8\xFF\xE0", "GIF89a", "RIFF....WEBP", "<svg/>"}) {
        notification_.indicatorIcon = picture("picture", beginning);
        EXPECT_EQ(seen().icon, notification_.indicatorIcon);
    }
}

}  // namespace
