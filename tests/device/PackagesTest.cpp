#include "device/Packages.h"

#include "support/Message.h"
#include "support/Process.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <random>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/sysmacros.h>
#include <sys/un.h>

namespace {

using device::Package;
using device::PackageEvent;
using support::messageOf;
using support::Process;
using support::readFile;
using support::TemporaryDevice;
using support::writeFile;
using testing::AllOf;
using testing::ElementsAre;
using testing::Field;
using testing::IsEmpty;

std::vector<std::string> idsOf(const std::vector<Package>& packages) {
    std::vector<std::string> ids;
    for (const Package& package : packages)
        ids.push_back(package.id);
    return ids;
}

class Packages : public testing::Test {
protected:
    std::filesystem::path makePackage(const std::string& id, const std::string& version = "1.0.0") const {
        return TemporaryDevice::makePackage(device.folder() / "elsewhere" / (id + version), id, version);
    }
    /// What lies beside the installed packages, hidden.
    std::vector<std::string> remains() const {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(device.root() / "opt/usr/apps"))
            if (entry.path().filename().string().rfind(".installing-", 0) == 0)
                names.push_back(entry.path().filename().string());
        return names;
    }

    TemporaryDevice device{"com.example.app", "3.0"};
    device::Packages& packages = device->packages();
};

TEST_F(Packages, ThatTheBuildShipsAreThere) {
    const auto package = packages.find("com.example.app");
    ASSERT_TRUE(package);
    EXPECT_EQ(package->version, "3.0");
    EXPECT_EQ(package->root, device.preinstalled() / "com.example.app");
    EXPECT_EQ(package->label, "Label of com.example.app");
    EXPECT_TRUE(package->preinstalled);
    EXPECT_EQ(packages.rootOf("com.example.app"), device.preinstalled() / "com.example.app");
}

TEST_F(Packages, ThatNobodyInstalledAreNot) {
    for (const char* id : {"com.example.none", "", ".", "..", "../apps/com.example.app", "com.example.app/",
                           "com.example.app/res", "/"}) {
        EXPECT_EQ(packages.rootOf(id), std::nullopt) << id;
        EXPECT_FALSE(packages.find(id)) << id;
    }
}

TEST_F(Packages, AreListedInTheOrderOfTheirIds) {
    device.addPackage("com.example.zebra");
    device.addPackage("com.example.ant");
    packages.install(makePackage("com.example.bee"));
    EXPECT_THAT(idsOf(packages.all()),
                ElementsAre("com.example.ant", "com.example.app", "com.example.bee", "com.example.zebra"));
}

TEST_F(Packages, WithABrokenManifestAreLeftOutOfTheListAndToldOfWhenAskedFor) {
    device.addPackage("com.example.broken");
    const auto manifest = device.preinstalled() / "com.example.broken/tizen-manifest.xml";
    writeFile(manifest, "<manifest");
    EXPECT_THAT(idsOf(packages.all()), ElementsAre("com.example.app"));
    EXPECT_EQ(messageOf([&] { packages.find("com.example.broken"); }),
              manifest.string() + ":1: is not well-formed XML: Couldn't find end of Start Tag manifest line 1");
}

TEST_F(Packages, MustLieInAFolderOfTheirName) {
    TemporaryDevice::makePackage(device.preinstalled() / "com.example.folder", "com.example.inside");
    EXPECT_EQ(messageOf([&] { packages.find("com.example.folder"); }),
              (device.preinstalled() / "com.example.folder/tizen-manifest.xml").string() +
                  ": the package's id \"com.example.inside\" differs from the name of its folder; they must be equal");
}

TEST_F(Packages, AreInstalledAsACopyOfAllTheirFiles) {
    const auto source = makePackage("com.example.tea");
    writeFile(source / "shared/res/contents/deep/tip.xml", "<tip/>");
    writeFile(source / "bin/app", "#!/bin/sh\n");
    std::filesystem::permissions(source / "bin/app", std::filesystem::perms(0755));
    writeFile(source / "empty", "");
    writeFile(source / "large", std::string(5 << 20, 'x'));
    const Package package = packages.install(source);
    std::filesystem::remove_all(source);

    EXPECT_EQ(package.root, device.root() / "opt/usr/apps/com.example.tea");
    EXPECT_EQ(package.icon, (package.root / "shared/res/icon.png").string());
    EXPECT_FALSE(package.preinstalled);
    EXPECT_EQ(packages.rootOf("com.example.tea"), package.root);
    EXPECT_EQ(readFile(package.root / "shared/res/contents/deep/tip.xml"), "<tip/>");
    EXPECT_EQ(std::filesystem::status(package.root / "bin/app").permissions(), std::filesystem::perms(0755));
    EXPECT_EQ(std::filesystem::file_size(package.root / "large"), 5U << 20);
    EXPECT_TRUE(std::filesystem::exists(package.root / "empty"));
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(Packages, StayInstalledWhenTheDeviceIsOpenedAnew) {
    packages.install(makePackage("com.example.tea"));
    device.reopen();
    EXPECT_TRUE(device->packages().find("com.example.tea"));
}

TEST_F(Packages, AreReplacedWholeByAnUpdate) {
    const auto old = makePackage("com.example.tea", "1.0");
    writeFile(old / "only-in-the-old-one", "");
    packages.install(old);
    EXPECT_EQ(packages.install(makePackage("com.example.tea", "2.0")).version, "2.0");
    EXPECT_EQ(packages.find("com.example.tea")->version, "2.0");
    EXPECT_FALSE(std::filesystem::exists(*packages.rootOf("com.example.tea") / "only-in-the-old-one"));
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(Packages, OfTheBuildAreCoveredByAnUpdateAndRemovedForGood) {
    packages.install(makePackage("com.example.app", "4.0"));
    EXPECT_EQ(packages.find("com.example.app")->version, "4.0");
    EXPECT_FALSE(packages.find("com.example.app")->preinstalled);
    packages.uninstall("com.example.app");
    device.reopen();
    EXPECT_FALSE(device->packages().find("com.example.app"));
    EXPECT_THAT(device->packages().all(), IsEmpty());
    EXPECT_TRUE(std::filesystem::exists(device.preinstalled() / "com.example.app/tizen-manifest.xml"));
}

TEST_F(Packages, AreGoneWithTheirFilesAfterTheirRemoval) {
    const auto root = packages.install(makePackage("com.example.tea")).root;
    packages.uninstall("com.example.tea");
    EXPECT_EQ(packages.rootOf("com.example.tea"), std::nullopt);
    EXPECT_FALSE(std::filesystem::exists(root));
    EXPECT_EQ(messageOf([&] { packages.uninstall("com.example.tea"); }),
              "\"com.example.tea\" is not installed; see the device's list of packages");
}

TEST_F(Packages, CanComeBackAfterTheirRemoval) {
    packages.uninstall("com.example.app");
    packages.install(makePackage("com.example.app", "5.0"));
    EXPECT_EQ(packages.find("com.example.app")->version, "5.0");
}

auto isEvent(PackageEvent::Type type, PackageEvent::State state, int progress, int error = 0) {
    return AllOf(Field(&PackageEvent::id, "com.example.tea"), Field(&PackageEvent::type, type),
                 Field(&PackageEvent::state, state), Field(&PackageEvent::progress, progress),
                 Field(&PackageEvent::error, error));
}

class PackageEvents : public Packages {
protected:
    using Type = PackageEvent::Type;
    using State = PackageEvent::State;

    std::vector<PackageEvent> told;
    /// The version that was installed when "completed" or "failed" came.
    std::string versionAtTheEnd = "not told";
    device::Events::Subscription subscription = device->events().onPackage([this](const PackageEvent& event) {
        told.push_back(event);
        if (event.state != State::Completed && event.state != State::Failed)
            return;
        const auto package = packages.find(event.id);
        versionAtTheEnd = package ? package->version : "none";
    });
};

TEST_F(PackageEvents, TellOfAnInstallationWhenItsFilesAreInPlace) {
    packages.install(makePackage("com.example.tea", "1.0"));
    EXPECT_THAT(told,
                ElementsAre(isEvent(Type::Install, State::Started, 0), isEvent(Type::Install, State::Processing, 50),
                            isEvent(Type::Install, State::Completed, 100)));
    EXPECT_EQ(versionAtTheEnd, "1.0");
}

TEST_F(PackageEvents, TellOfAnUpdate) {
    packages.install(makePackage("com.example.tea", "1.0"));
    told.clear();
    packages.install(makePackage("com.example.tea", "2.0"));
    EXPECT_THAT(told,
                ElementsAre(isEvent(Type::Update, State::Started, 0), isEvent(Type::Update, State::Processing, 50),
                            isEvent(Type::Update, State::Completed, 100)));
    EXPECT_EQ(versionAtTheEnd, "2.0");
}

TEST_F(PackageEvents, TellOfARemoval) {
    packages.install(makePackage("com.example.tea"));
    told.clear();
    packages.uninstall("com.example.tea");
    EXPECT_THAT(told, ElementsAre(isEvent(Type::Uninstall, State::Started, 0),
                                  isEvent(Type::Uninstall, State::Processing, 50),
                                  isEvent(Type::Uninstall, State::Completed, 100)));
    EXPECT_EQ(versionAtTheEnd, "none");
}

TEST_F(PackageEvents, TellOfAFailureThatChangedNothing) {
    packages.install(makePackage("com.example.tea", "1.0"));
    told.clear();
    const auto bad = makePackage("com.example.tea", "2.0");
    std::filesystem::create_symlink("/etc/passwd", bad / "link");
    EXPECT_THROW(packages.install(bad), device::Error);
    EXPECT_THAT(told,
                ElementsAre(isEvent(Type::Update, State::Started, 0), isEvent(Type::Update, State::Failed, 0, -EIO)));
    EXPECT_EQ(versionAtTheEnd, "1.0");
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(PackageEvents, AreNoneForWhatIsNoPackage) {
    EXPECT_THROW(packages.install(device.folder()), device::Error);
    EXPECT_THROW(packages.uninstall("com.example.none"), device::Error);
    EXPECT_THAT(told, IsEmpty());
}

class RefusedPackages : public Packages {
protected:
    std::string messageFor(const std::filesystem::path& folder) const {
        const std::string message = messageOf([&] { packages.install(folder); });
        EXPECT_FALSE(packages.find("com.example.tea"));
        return message;
    }
    std::filesystem::path source = makePackage("com.example.tea");
};

TEST_F(RefusedPackages, HoldLinksOrWhatIsNoFile) {
    std::filesystem::create_symlink(source / "tizen-manifest.xml", source / "res/link");
    EXPECT_EQ(messageFor(source), (source / "res/link").string() +
                                      ": is a link; a package holds files and folders only, put the file itself there");
    std::filesystem::remove(source / "res/link");
    std::filesystem::create_directory_symlink("/etc", source / "shared/etc");
    EXPECT_EQ(messageFor(source), (source / "shared/etc").string() +
                                      ": is a link; a package holds files and folders only, put the file itself there");
    std::filesystem::remove(source / "shared/etc");
    ASSERT_EQ(mkfifo((source / "pipe").c_str(), 0600), 0);
    EXPECT_EQ(messageFor(source),
              (source / "pipe").string() + ": is neither a file nor a folder; remove it from the package");
    std::filesystem::remove(source / "pipe");
    if (mknod((source / "node").c_str(), S_IFCHR | 0600, makedev(1, 3)) == 0) {
        EXPECT_EQ(messageFor(source),
                  (source / "node").string() + ": is neither a file nor a folder; remove it from the package");
        std::filesystem::remove(source / "node");
    }
    EXPECT_EQ(packages.install(source).id, "com.example.tea");
}

TEST_F(RefusedPackages, HoldSockets) {
    const int listening = socket(AF_UNIX, SOCK_STREAM, 0);
    sockaddr_un name{};
    name.sun_family = AF_UNIX;
    (source / "socket").string().copy(name.sun_path, sizeof name.sun_path - 1);
    ASSERT_EQ(bind(listening, reinterpret_cast<const sockaddr*>(&name), sizeof name), 0);
    EXPECT_EQ(messageFor(source),
              (source / "socket").string() + ": is neither a file nor a folder; remove it from the package");
    close(listening);
}

TEST_F(RefusedPackages, AreNoFolder) {
    EXPECT_EQ(messageFor(device.folder() / "none"),
              (device.folder() / "none").string() + ": No such file or directory; name the folder of a package");
    EXPECT_EQ(messageFor(source / "tizen-manifest.xml"),
              (source / "tizen-manifest.xml").string() + ": is not a folder; name the folder of a package");
}

TEST_F(RefusedPackages, LieInTheDevicesOwnFolderOrAroundIt) {
    const std::string reason = ": the device's own folder " + device.root().string() +
                               " and the package lie in each other; install from another folder";
    const auto inside = TemporaryDevice::makePackage(device.root() / "inside", "com.example.tea");
    EXPECT_EQ(messageFor(inside), inside.string() + reason);
    std::filesystem::create_directory_symlink(inside, device.folder() / "link");
    EXPECT_EQ(messageFor(device.folder() / "link"), (device.folder() / "link").string() + reason);
    TemporaryDevice::makePackage(device.folder(), "com.example.tea");
    EXPECT_EQ(messageFor(device.folder()), device.folder().string() + reason);
    EXPECT_EQ(messageFor("/"), "/" + reason);
}

TEST_F(RefusedPackages, DoNotFitOnTheDisk) {
    writeFile(source / "large", std::string(2 << 20, 'x'));
    auto installer = Process::ofWork([&] {
        signal(SIGXFSZ, SIG_IGN);
        device::Device same(device.options());
        const rlimit limit{1 << 20, 1 << 20};
        setrlimit(RLIMIT_FSIZE, &limit);
        const std::string message = messageOf([&] { same.packages().install(source); });
        const std::string expected = (source / "large").string() + ": cannot be copied to " +
                                     (device.root() / "opt/usr/apps/.installing-").string();
        const std::string end = "/large: File too large";
        return message.rfind(expected, 0) == 0 && message.size() == expected.size() + 6 + end.size() &&
                       message.substr(expected.size() + 6) == end
                   ? 0
                   : 1;
    });
    EXPECT_EQ(installer.wait(), 0);
    EXPECT_FALSE(packages.find("com.example.tea"));
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(Packages, ThatCannotBeNotedDownAreNotInstalled) {
    device->database().sql().exec(
        "CREATE TRIGGER refuse BEFORE INSERT ON package BEGIN SELECT RAISE(ABORT, 'no'); END");
    EXPECT_EQ(messageOf([&] { packages.install(makePackage("com.example.tea")); }),
              device.root().string() + "/device.db: cannot be used (no)");
    EXPECT_FALSE(std::filesystem::exists(device.root() / "opt/usr/apps/com.example.tea"));
    EXPECT_THAT(remains(), IsEmpty());
    device->database().sql().exec("DROP TRIGGER refuse");

    packages.install(makePackage("com.example.tea", "1.0"));
    device->database().sql().exec(
        "CREATE TRIGGER refuse BEFORE UPDATE ON package BEGIN SELECT RAISE(ABORT, 'no'); END");
    EXPECT_EQ(messageOf([&] { packages.install(makePackage("com.example.tea", "2.0")); }),
              device.root().string() + "/device.db: cannot be used (no)");
    EXPECT_EQ(packages.find("com.example.tea")->version, "1.0");
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(Packages, AreWholeAfterAnInstallationIsKilledAtAnyMoment) {
    const auto versions = {makePackage("com.example.tea", "1.0"), makePackage("com.example.tea", "2.0")};
    for (const auto& source : versions)
        for (int number = 0; number < 40; ++number)
            writeFile(source / ("res/" + std::to_string(number)), std::string(20000, 'x'));
    packages.install(*versions.begin());
    std::mt19937 random(4711);
    std::uniform_int_distribution<int> microseconds(0, 15000);
    for (int round = 0; round < 40; ++round) {
        auto installer = Process::ofWork([&] {
            device::Device same(device.options());
            for (;;)
                for (const auto& source : versions)
                    same.packages().install(source);
            return 0;
        });
        // The moment is the point of this test: a real one, at random, while the installer runs.
        usleep(static_cast<useconds_t>(microseconds(random)));
        installer.end(SIGKILL);
        const auto package = packages.find("com.example.tea");
        ASSERT_TRUE(package);
        for (int number = 0; number < 40; ++number)
            ASSERT_EQ(std::filesystem::file_size(package->root / ("res/" + std::to_string(number))), 20000U);
    }
    packages.install(makePackage("com.example.other"));
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(Packages, ThatAnUnfinishedRemovalLeftAreCleanedByTheNextInstallation) {
    const auto left = TemporaryDevice::makePackage(device.root() / "opt/usr/apps/com.example.left", "com.example.left");
    EXPECT_FALSE(packages.find("com.example.left"));
    packages.install(makePackage("com.example.tea"));
    EXPECT_FALSE(std::filesystem::exists(left));
}

TEST_F(Packages, MayBeInstalledByTwoProcessesAtOnce) {
    std::vector<std::filesystem::path> sources;
    for (int number = 0; number < 10; ++number)
        sources.push_back(makePackage("com.example.tea", std::to_string(number)));
    const auto installer = [&] {
        return Process::ofWork([&] {
            device::Device same(device.options());
            for (const auto& source : sources)
                same.packages().install(source);
            return 0;
        });
    };
    Process first = installer();
    Process second = installer();
    EXPECT_EQ(first.wait(), 0);
    EXPECT_EQ(second.wait(), 0);
    EXPECT_EQ(packages.find("com.example.tea")->version, "9");
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(Packages, WhoseFolderSomebodyDeletedAreNotInstalled) {
    std::filesystem::remove_all(packages.install(makePackage("com.example.tea")).root);
    EXPECT_FALSE(packages.find("com.example.tea"));
    EXPECT_THAT(idsOf(packages.all()), ElementsAre("com.example.app"));
}

TEST_F(Packages, OfTheFirstOfSeveralFoldersWin) {
    const auto second = device.folder() / "second";
    TemporaryDevice::makePackage(second / "com.example.app", "com.example.app", "9.9");
    TemporaryDevice::makePackage(second / "com.example.more", "com.example.more");
    device::Device::Options options = device.options();
    options.preinstalled.push_back(second);
    device::Device same(options);
    EXPECT_EQ(same.packages().find("com.example.app")->version, "3.0");
    EXPECT_THAT(idsOf(same.packages().all()), ElementsAre("com.example.app", "com.example.more"));
}

}  // namespace
